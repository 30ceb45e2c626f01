#pragma once
// The report's parameters: output units, the twelve column flags, and the page size of the
// printed record list. The flags travel between documents as the ORDER key of NEDIT.INI.

#include <string>

struct OutParamStruct {
    int AngularUnit = 0;  // 0 DDD MM SS, 1 decimal degrees, 2 gon
    int LinearUnit = 0;   // 0 metres, 1 feet, 2 US feet
    int OutID = 1;
    int OutLN = 1;
    int OutHA = 1;
    int OutVA = 1;
    int OutSD = 1;
    int OutHD = 1;
    int OutVD = 1;
    int OutHT = 1;
    int OutCO = 1;
    int OutEC = 1;
    int OutNC = 1;
    int OutHC = 1;
    int PageSize = 55;
};

/// Option ids of the report: the controls of the parameter dialog.
namespace opt {
constexpr int AngleDms = 1011, AngleDegrees = 1012, AngleGons = 1013;
constexpr int LengthMetres = 1014, LengthFeet = 1015;
constexpr int ID = 1016, LN = 1017, VA = 1019, SD = 1020, VD = 1022, HT = 1023;
constexpr int EC = 1025, NC = 1026, HC = 1027, HA = 1028, HD = 1029, CO = 1030;
}  // namespace opt

/// The value of an option: the units for 1011 to 1015, a column flag for its id, else 0.
int GetCheckOn(const OutParamStruct& parameters, int id);
/// The flag of a column's option id; null for an id that is no column.
int* ColumnFlag(OutParamStruct& parameters, int id);

/// Sets each flag by whether its token (ID, LN, HA, VA, SD, HD, VD, HT, CO, EC, NC, HC)
/// occurs anywhere in `order`, without regard to case: an empty text turns all flags off.
void SetFlagsFromOrder(OutParamStruct& parameters, const std::wstring& order);
/// True for the token of a column (ID, LN, HA, VA, SD, HD, VD, HT, CO, EC, NC, HC), in any case.
bool IsColumnToken(const std::wstring& token);
/// The tokens of the flags that are on, each followed by one blank, in the order above.
std::wstring OrderText(const OutParamStruct& parameters);
