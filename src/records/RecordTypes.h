#pragma once
// Record types and field ids shared by the whole system. The numbers are fixed: they are how
// every part of the system names a record or a field.

namespace rec {
constexpr int None = 0;  // a row with no known record key
constexpr int Comment = 99;
constexpr int Note = 100;
constexpr int Job = 101;
constexpr int Date = 102;
constexpr int Name = 103;
constexpr int Unit = 104;
constexpr int Amode = 105;
constexpr int Acorr = 106;
constexpr int Swing = 107;
constexpr int Smode = 108;
constexpr int Pt = 109;
constexpr int Stn = 110;
constexpr int Bkb = 111;
constexpr int Xyz = 112;
constexpr int Bs = 113;
constexpr int Ss = 114;
constexpr int Offset = 115;
constexpr int Insht = 116;
constexpr int Targetht = 117;
constexpr int Scale = 118;
constexpr int Atmos = 119;
constexpr int Edm = 120;
constexpr int EdmConst = 121;
constexpr int Radius = 122;
constexpr int Dcorr = 123;
constexpr int Prism = 125;
constexpr int Drec = 126;
constexpr int Instru = 127;
constexpr int Unit2 = 128;
constexpr int AdjPts = 132;
constexpr int PSX = 133;
constexpr int PSN = 134;
constexpr int Yxz = 135;
constexpr int Targetht2 = 136;
constexpr int Image = 137;
constexpr int Ss2 = 138;
constexpr int Attrib = 139;
}  // namespace rec

namespace fld {
constexpr int ID = 800;
constexpr int HA = 801;
constexpr int VA = 802;
constexpr int SD = 803;
constexpr int HD = 804;
constexpr int VD = 805;
constexpr int HT = 806;
constexpr int HI = 807;
constexpr int CO = 808;
constexpr int E = 809;
constexpr int N = 810;
constexpr int H = 811;
constexpr int OffsetAlong = 812;
constexpr int OffsetRight = 813;
constexpr int OffsetUp = 814;
constexpr int UL = 815;
constexpr int UA = 816;
constexpr int HMode = 819;
constexpr int VMode = 820;
constexpr int HCorr = 821;
constexpr int VCorr = 822;
constexpr int BkBearing = 823;
constexpr int Bearing2 = 824;
constexpr int Number1 = 839;
constexpr int Number2 = 840;
constexpr int File = 841;
constexpr int AttribName = 842;
constexpr int AttribType = 843;
constexpr int AttribValue = 844;
}  // namespace fld

/// The header line of a neutral file, and the marker row before adjusted points.
constexpr const wchar_t* kNeutralFileHeader = L"#VERSION-1.0 NEUTRAL FILE";
constexpr const wchar_t* kAdjustedPointsMarker = L"##########ADJUSTED-POINTS";
/// No row holds more characters than this.
constexpr int kMaxRowLength = 255;
