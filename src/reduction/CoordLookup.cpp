// Where a station's or point's coordinates come from: the stations of this run, its points,
// the coordinate records, the job, or the user; and the store of bearings between stations.

#include <fstream>

#include "platform/geometry/UAngle.h"
#include "platform/io/LineReader.h"
#include "platform/text/Format.h"
#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"
#include "records/RecordTypes.h"
#include "records/RowSource.h"
#include "reduction/UCoordEntryDlg.h"
#include "reduction/UNeditDatabase.h"

namespace {

// An empty name in the bearing store stands as this text, so it has a key like any other.
constexpr const wchar_t* kNoName = L"-99999";

std::wstring BearingKey(const std::wstring& from, const std::wstring& to) {
    return from + L'\x1f' + to;
}

double Reverse(double bearing) {
    return UAngle::ValidateData(bearing + 180.0);
}

}  // namespace

int UNeditDatabase::findCoord(const std::wstring& name, double& e, double& n, double& z,
                              std::wstring& code, int fix, bool askUser) {
    {
        for (const STNSTRUCT* station = FirstNamed(name); station != nullptr;
             station = station->NextSameName) {
            if (!station->CoordKnown) {
                code = station->StnCode;
                continue;
            }
            e = station->East;
            n = station->North;
            z = station->Height;
            code = station->StnCode;
            if (station->CoordFixed == 1 || fix == 0) return 1;
            break;
        }
    }
    if (GetPointFromPtList(name, e, n, z, code, 1)) return 1;

    if (JobHasPoint(name)) {
        if (DbCoordNames.count(name) != 0 && GetCoordFromSvyDoc(name, e, n, z, code)) {
            setCoord(name, e, n, z, code, kSetCoordOverwrite, fix, 0);
            return 1;
        }
        if (LocalCoordNames.count(name) == 0) {
            if (!getCoord(name, &e, &n, &z, code, 1, askUser)) {
                ErrorCode = -11;
                return 0;
            }
            if (DbCoordNames.count(name) != 0) return 1;
            setCoord(name, e, n, z, code, kSetCoordOverwrite, fix, 0);
            SaveTravPoint(name, e, n, z, code, 1);
            return 1;
        }
    }

    const auto known = KnownCoordMap.find(name);
    if (known == KnownCoordMap.end()) {
        if (!GetPointFromPtList(name, e, n, z, code, 0)) return 0;
        setCoord(name, e, n, z, code, kSetCoordOverwrite, fix, 0);
        return 1;
    }
    e = known->second.East;
    n = known->second.North;
    z = known->second.Height;
    if (LocalCoordNames.count(name) != 0) {
        setCoord(name, e, n, z, code, kSetCoordOverwrite, fix, 0);
        return 1;
    }
    if (!getCoord(name, &e, &n, &z, code, 1, askUser)) {
        ErrorCode = -11;
        return 0;
    }
    setCoord(name, e, n, z, code, kSetCoordOverwrite, fix, 0);
    SaveTravPoint(name, e, n, z, code, 1);
    return 1;
}

int UNeditDatabase::getCoord(const std::wstring& name, double* e, double* n, double* z,
                             std::wstring& code, int clear, bool showDialog) {
    if (ErrorCode != 0 && GetError() != 0) return 0;
    if (clear) {
        *e = *n = 0.0;
        *z = kNoHeight;
        code.clear();
    }
    UCoordEntryDlg dialog(
        CoordsOrderXY() ? UCoordEntryDlg::kEastFirstId : UCoordEntryDlg::kNorthFirstId, Host);
    dialog.SetName(name);

    double job_e = 0.0, job_n = 0.0, job_z = kNoHeight;
    std::wstring job_code;
    if (GetCoordFromSvyDoc(name, job_e, job_n, job_z, job_code)) {
        if (DbCoordNames.count(name) != 0) {
            *e = job_e;
            *n = job_n;
            *z = job_z;
            code = job_code;
            return 1;
        }
        dialog.InitXYZSvy(job_e, job_n, job_z, job_code);
    }
    const auto known = KnownCoordMap.find(name);
    if (known != KnownCoordMap.end()) {
        if (LocalCoordNames.count(name) != 0) {
            *e = known->second.East;
            *n = known->second.North;
            *z = known->second.Height;
            return 1;
        }
        double pe = 0.0, pn = 0.0, pz = kNoHeight;
        std::wstring point_code;
        if (GetPointFromPtList(name, pe, pn, pz, point_code, 0)) {
            dialog.InitXYZLocal(pe, pn, pz, point_code);
        } else {
            dialog.InitXYZLocal(known->second.East, known->second.North, known->second.Height,
                                code);
        }
    }
    const int answer = showDialog ? dialog.process(name, UseForAll) : dialog.ProcessOnly(name);
    if (answer != 1) return 0;
    *e = dialog.getEast();
    *n = dialog.getNorth();
    *z = dialog.getZ();
    code = dialog.getCode();
    if (dialog.GetChosenSource() == UCoordEntryDlg::Source::Database) {
        DbCoordNames[name] = true;
    } else {
        LocalCoordNames[name] = true;
    }
    return 1;
}

int UNeditDatabase::setCoord(const std::wstring& name, double e, double n, double z,
                             const std::wstring& code, int flags, int fix, int ptFlag) {
    if (name.empty()) return 0;
    if (STNSTRUCT* first = FirstNamed(name)) {
        bool written = false;
        for (STNSTRUCT* station = first; station != nullptr; station = station->NextSameName) {
            if (station->CoordKnown && (flags & kSetCoordOverwrite) == 0) {
                SavePoint(name, e, n, z, code, ptFlag, 0, 0);
                continue;
            }
            station->East = e;
            station->North = n;
            station->Height = z;
            if (!code.empty()) station->StnCode = code;
            station->CoordFixed = fix;
            station->CoordKnown = 1;
            SavePoint(name, e, n, z, station->StnCode, ptFlag, 0, 0);
            written = true;
        }
        return written ? 1 : 0;
    }
    auto point = std::make_unique<STNSTRUCT>();
    point->StnName = name;
    point->East = e;
    point->North = n;
    point->Height = z;
    point->StnCode = code;
    point->CoordKnown = 1;
    point->PointOnly = 1;
    point->HMode = HMode;
    point->VMode = VMode;
    point->AngleUnit = AngleUnit;
    point->LengthUnit = LengthUnit;
    AppendStation(std::move(point));
    SavePoint(name, e, n, z, code, ptFlag, 0, 0);
    return 1;
}

int UNeditDatabase::GetCoordFromStnList(const std::wstring& name, double& e, double& n, double& z,
                                        std::wstring& code) const {
    for (const STNSTRUCT* station = FirstNamed(name); station != nullptr;
         station = station->NextSameName) {
        if (!station->CoordKnown) continue;
        e = station->East;
        n = station->North;
        z = station->Height;
        code = station->StnCode;
        return 1;
    }
    return 0;
}

int UNeditDatabase::GetPointFromPtList(const std::wstring& name, double& e, double& n, double& z,
                                       std::wstring& code, unsigned mode) const {
    const int index = GetPointIdx(name);
    if (index < 0) return 0;
    const UNeditPt& point = PointList[static_cast<std::size_t>(index)];
    e = point.x;
    n = point.y;
    z = point.z;
    code = point.GetCode();
    return mode == 1 && point.IsPTRecord() ? 0 : 1;
}

int UNeditDatabase::FindCoordinateRow(const nedit::RowSource* rows, const std::wstring& name,
                                      bool coordinates, int type, double* e, double* n, double* z) {
    if (rows == nullptr || Doc == nullptr) return -1;
    for (int row = 0; row < rows->GetItemCount(); ++row) {
        const std::wstring text = nedit::ToUpper(nedit::TrimView(rows->GetItemText(row)));
        const int row_type = Doc->GetRecordType(text);
        const bool wanted =
            coordinates ? (row_type == rec::Xyz || row_type == rec::Yxz) : row_type == type;
        if (!wanted || !Doc->ProcessRecord(row_type, text, Fields)) continue;
        if (GetValue(fld::ID) != name) continue;
        if (coordinates) {
            *e = nedit::TextToDouble(GetValue(fld::E));
            *n = nedit::TextToDouble(GetValue(fld::N));
            *z = nedit::TextToDouble(GetValue(fld::H));
        }
        return row;
    }
    return -1;
}

int UNeditDatabase::FindXYZ(const std::wstring& name, double& e, double& n, double& z) {
    return FindCoordinateRow(Rows, name, true, rec::Xyz, &e, &n, &z);
}

int UNeditDatabase::FindXYZ(const nedit::RowSource& rows, const std::wstring& name, double& e,
                            double& n, double& z) {
    return FindCoordinateRow(&rows, name, true, rec::Xyz, &e, &n, &z);
}

int UNeditDatabase::FindRecord(int type, const std::wstring& name) {
    return FindCoordinateRow(Rows, name, false, type, nullptr, nullptr, nullptr);
}

std::wstring UNeditDatabase::FormatXYZRecord(const std::wstring& name, double e, double n,
                                             double z) const {
    std::wstring key = L"XYZ", id = L"ID", east = L"E", north = L"N", height = L"H";
    if (Doc != nullptr) {
        Doc->FindRecordKey(rec::Xyz, key);
        Doc->FindRecordField(fld::ID, id);
        Doc->FindRecordField(fld::E, east);
        Doc->FindRecordField(fld::N, north);
        Doc->FindRecordField(fld::H, height);
        e = Doc->ConvertDist(e, true);
        n = Doc->ConvertDist(n, true);
        z = Doc->ConvertDist(z, true);
    }
    return nedit::Format(L"%-8s %s=%s,%s=%.3f,%s=%.3f,%s=%.3f", key, id, name, east, e, north, n,
                         height, z);
}

std::wstring UNeditDatabase::FormatBKBRecord(const std::wstring& name, double reading,
                                             double bearing) const {
    std::wstring key = L"BKB", id = L"ID", circle = L"HA", back = L"BRG";
    int decimals = 4;
    if (Doc != nullptr) {
        Doc->FindRecordKey(rec::Bkb, key);
        Doc->FindRecordField(fld::ID, id);
        Doc->FindRecordField(fld::HA, circle);
        Doc->FindRecordField(fld::BkBearing, back);
        reading = Doc->ConvertToAngleDisplayUnit(reading);
        bearing = Doc->ConvertToAngleDisplayUnit(bearing);
        if (Doc->GetJobSettings() != nullptr) decimals = Doc->GetJobSettings()->GetAngleDecimals();
    }
    const std::wstring format =
        nedit::Format(L"%%-8s %%s=%%s,%%s=%%.%df,%%s=%%.%df", decimals, decimals);
    return nedit::Format(format, key, id, name, circle, reading, back, bearing);
}

double UNeditDatabase::GetBearingFromArray(std::wstring from, std::wstring to) const {
    if (from.empty()) from = kNoName;
    if (to.empty()) to = kNoName;
    int direction = 0;
    const int index = GetBearingArray(from, to, direction);
    if (index < 0) return -1.0;
    const double stored = LineBearings[static_cast<std::size_t>(index)].Bearing;
    return direction == 1 ? stored : Reverse(stored);
}

int UNeditDatabase::GetBearingArray(const std::wstring& from, const std::wstring& to,
                                    int& direction) const {
    const auto as_stored = BearingIndex.find(BearingKey(from, to));
    const auto reversed = BearingIndex.find(BearingKey(to, from));
    const std::size_t none = LineBearings.size();
    const std::size_t stored_at = as_stored == BearingIndex.end() ? none : as_stored->second;
    const std::size_t reversed_at = reversed == BearingIndex.end() ? none : reversed->second;
    // Entries are tried in order: the earlier of the two matches answers.
    if (stored_at == none && reversed_at == none) {
        direction = 0;
        return -1;
    }
    if (stored_at <= reversed_at) {
        direction = 1;
        return static_cast<int>(stored_at);
    }
    direction = -1;
    return static_cast<int>(reversed_at);
}

int UNeditDatabase::InsertBearingArray(std::wstring from, std::wstring to, double bearing) {
    if (from.empty()) from = kNoName;
    if (to.empty()) to = kNoName;
    int direction = 0;
    const int index = GetBearingArray(from, to, direction);
    if (index < 0) {
        BearingIndex.emplace(BearingKey(from, to), LineBearings.size());
        LineBearings.push_back({from, to, bearing});
        return static_cast<int>(LineBearings.size()) - 1;
    }
    LineBearings[static_cast<std::size_t>(index)].Bearing =
        direction == 1 ? bearing : Reverse(bearing);
    return index;
}

std::wstring UNeditDatabase::BearingFileName() const {
    if (FileName.empty()) return {};
    const std::size_t dot = FileName.rfind(L'.');
    const std::size_t slash = FileName.find_last_of(L"/\\");
    // A name without an extension gets one.
    if (dot == std::wstring::npos || (slash != std::wstring::npos && dot < slash))
        return FileName + L".$BR";
    return FileName.substr(0, dot) + L".$BR";
}

int UNeditDatabase::LoadBearingArray() {
    const std::wstring path = BearingFileName();
    if (path.empty()) return 0;
    nedit::LineReader reader(254);
    if (!reader.Open(nedit::ToUtf8(path))) return 0;
    for (std::string line; reader.ReadLine(line);) {
        const std::wstring text = nedit::DecodeTextLine(line);
        const std::size_t first = text.find(L',');
        const std::size_t second = first == std::wstring::npos ? first : text.find(L',', first + 1);
        if (second == std::wstring::npos || text.find(L',', second + 1) != std::wstring::npos)
            continue;
        InsertBearingArray(text.substr(0, first), text.substr(first + 1, second - first - 1),
                           nedit::TextToDouble(text.substr(second + 1)));
    }
    return 1;
}

int UNeditDatabase::SaveBearingArray() const {
    const std::wstring path = BearingFileName();
    if (path.empty()) return 0;
    std::ofstream file(nedit::ToUtf8(path), std::ios::binary | std::ios::trunc);
    if (!file) return 0;
    for (const ULINEBEAR_STRUCT& entry : LineBearings) {
        file << nedit::ToUtf8(
            nedit::Format(L"%s,%s,%.8f\n", entry.FromName, entry.ToName, entry.Bearing));
    }
    return file.good() ? 1 : 0;
}

int UNeditDatabase::DeleteBearingArray() {
    LineBearings.clear();
    BearingIndex.clear();
    return 1;
}
