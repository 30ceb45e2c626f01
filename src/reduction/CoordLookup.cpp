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
constexpr const wchar_t* kNameOfNone = L"-99999";

std::wstring BearingKey(const std::wstring& from, const std::wstring& to) {
    return from + L'\x1f' + to;
}

double Reverse(double bearing) {
    return UAngle::ValidateData(bearing + 180.0);
}

}  // namespace

int UNeditDatabase::findCoord(const std::wstring& name, double& e, double& n, double& z,
                              std::wstring& code, int fix, bool askUser) {
    return FindCoordOf(NameOf(name), e, n, z, code, fix, askUser);
}

int UNeditDatabase::FindCoordOf(NameId name, double& e, double& n, double& z, std::wstring& code,
                                int fix, bool askUser) {
    for (std::uint32_t node = FirstNodeOf(name); node != NodeEntry::kNone;
         node = Nodes[node].NextSameName) {
        int fixed = 0;
        if (!NodeCoordinates(node, e, n, z, code, fixed)) continue;
        if (fixed == 1 || fix == 0) return 1;
        break;
    }
    if (PointFromPtList(name, e, n, z, code, 1)) return 1;

    const std::wstring_view text = Names.Name(name);
    if (SurveyDoc != nullptr && JobHasPoint(std::wstring(text))) {
        if (DbCoordNames.count(text) != 0 &&
            GetCoordFromSvyDoc(std::wstring(text), e, n, z, code)) {
            SetCoordOf(name, e, n, z, code, kSetCoordOverwrite, fix, 0);
            return 1;
        }
        if (LocalCoordNames.count(text) == 0) {
            if (!GetCoordOf(name, &e, &n, &z, code, 1, askUser)) {
                ErrorCode = -11;
                return 0;
            }
            if (DbCoordNames.count(text) != 0) return 1;
            SetCoordOf(name, e, n, z, code, kSetCoordOverwrite, fix, 0);
            SaveTravPoint(std::wstring(text), e, n, z, code, 1);
            return 1;
        }
    }

    const KnownCoord* known = KnownCoordOf(name);
    if (known == nullptr) {
        if (!PointFromPtList(name, e, n, z, code, 0)) return 0;
        SetCoordOf(name, e, n, z, code, kSetCoordOverwrite, fix, 0);
        return 1;
    }
    e = known->East;
    n = known->North;
    z = known->Height;
    if (LocalCoordNames.count(text) != 0) {
        SetCoordOf(name, e, n, z, code, kSetCoordOverwrite, fix, 0);
        return 1;
    }
    if (!GetCoordOf(name, &e, &n, &z, code, 1, askUser)) {
        ErrorCode = -11;
        return 0;
    }
    SetCoordOf(name, e, n, z, code, kSetCoordOverwrite, fix, 0);
    SaveTravPoint(std::wstring(text), e, n, z, code, 1);
    return 1;
}

const KnownCoord* UNeditDatabase::KnownCoordOf(NameId name) const {
    if (KnownCoordMap.empty()) return nullptr;
    const auto found = KnownCoordMap.find(name);
    return found == KnownCoordMap.end() ? nullptr : &found->second;
}

int UNeditDatabase::getCoord(const std::wstring& name, double* e, double* n, double* z,
                             std::wstring& code, int clear, bool showDialog) {
    return GetCoordOf(NameOf(name), e, n, z, code, clear, showDialog);
}

int UNeditDatabase::GetCoordOf(NameId id, double* e, double* n, double* z, std::wstring& code,
                               int clear, bool showDialog) {
    if (ErrorCode != 0 && GetError() != 0) return 0;
    if (clear) {
        *e = *n = 0.0;
        *z = kNoHeight;
        code.clear();
    }
    const std::wstring name(Names.Name(id));
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
    if (const KnownCoord* known = KnownCoordOf(id)) {
        if (LocalCoordNames.count(name) != 0) {
            *e = known->East;
            *n = known->North;
            *z = known->Height;
            return 1;
        }
        double pe = 0.0, pn = 0.0, pz = kNoHeight;
        std::wstring point_code;
        if (PointFromPtList(id, pe, pn, pz, point_code, 0)) {
            dialog.InitXYZLocal(pe, pn, pz, point_code);
        } else {
            dialog.InitXYZLocal(known->East, known->North, known->Height, code);
        }
    }
    const int answer = showDialog ? dialog.process(name, UseForAll) : dialog.ProcessOnly(name);
    if (answer != 1) return 0;
    *e = dialog.getEast();
    *n = dialog.getNorth();
    *z = dialog.getZ();
    code = dialog.getCode();
    if (dialog.GetChosenSource() == UCoordEntryDlg::Source::Database) {
        DbCoordNames.insert(name);
    } else {
        LocalCoordNames.insert(name);
    }
    return 1;
}

int UNeditDatabase::setCoord(const std::wstring& name, double e, double n, double z,
                             const std::wstring& code, int flags, int fix, int ptFlag) {
    if (name.empty()) return 0;
    return SetCoordOf(NameOf(name), e, n, z, code, flags, fix, ptFlag);
}

int UNeditDatabase::SetCoordOf(NameId name, double e, double n, double z, std::wstring_view code,
                               int flags, int fix, int /*ptFlag*/) {
    if (Names.Name(name).empty()) return 0;
    const NameId code_id = code.empty() ? kNoName : CodeOf(code);
    bool any = false;
    bool written = false;
    for (std::uint32_t node = FirstNodeOf(name); node != NodeEntry::kNone;
         node = Nodes[node].NextSameName) {
        any = true;
        // Every node of a point-only name knows its coordinates.
        if (Nodes[node].IsPointOnly()) {
            PointNode& point = PointNodes[Nodes[node].Index()];
            if ((flags & kSetCoordOverwrite) == 0) {
                SavePointOf(name, e, n, z, code, 0, 0);
                continue;
            }
            point.East = e;
            point.North = n;
            point.Height = z;
            if (code_id != kNoName) point.Code = code_id;
            point.CoordFixed = fix;
            SavePointOf(name, e, n, z, CodeText(point.Code), 0, 0);
        } else {
            STNSTRUCT& station = Setups[Nodes[node].Index()];
            if (station.CoordKnown && (flags & kSetCoordOverwrite) == 0) {
                SavePointOf(name, e, n, z, code, 0, 0);
                continue;
            }
            station.East = e;
            station.North = n;
            station.Height = z;
            if (code_id != kNoName) station.StnCode = Codes.Name(code_id);
            station.CoordFixed = fix;
            station.CoordKnown = 1;
            SavePointOf(name, e, n, z, station.StnCode, 0, 0);
        }
        written = true;
    }
    if (any) return written ? 1 : 0;
    AppendPointNode(name, e, n, z, code_id);
    SavePointOf(name, e, n, z, code, 0, 0);
    return 1;
}

int UNeditDatabase::GetCoordFromStnList(const std::wstring& name, double& e, double& n, double& z,
                                        std::wstring& code) const {
    int fixed = 0;
    std::wstring node_code;
    for (std::uint32_t node = FirstNodeOf(Names.Find(name)); node != NodeEntry::kNone;
         node = Nodes[node].NextSameName) {
        if (NodeCoordinates(node, e, n, z, node_code, fixed)) {
            code = node_code;
            return 1;
        }
    }
    return 0;
}

bool UNeditDatabase::NodeCoordinates(std::uint32_t node, double& e, double& n, double& z,
                                     std::wstring& code, int& fixed) const {
    if (Nodes[node].IsPointOnly()) {
        const PointNode& point = PointNodes[Nodes[node].Index()];
        e = point.East;
        n = point.North;
        z = point.Height;
        code = CodeText(point.Code);
        fixed = point.CoordFixed;
        return true;
    }
    const STNSTRUCT& station = Setups[Nodes[node].Index()];
    code = station.StnCode;
    if (!station.CoordKnown) return false;
    e = station.East;
    n = station.North;
    z = station.Height;
    fixed = station.CoordFixed;
    return true;
}

int UNeditDatabase::GetPointFromPtList(const std::wstring& name, double& e, double& n, double& z,
                                       std::wstring& code, unsigned mode) const {
    return PointFromPtList(Names.Find(name), e, n, z, code, mode);
}

int UNeditDatabase::PointFromPtList(NameId name, double& e, double& n, double& z,
                                    std::wstring& code, unsigned mode) const {
    const int index = PointOf(name);
    if (index < 0) return 0;
    const UNeditPt& point = PointList[static_cast<std::size_t>(index)];
    e = point.x;
    n = point.y;
    z = point.z;
    code = point.GetCode();
    return mode == 1 && point.IsPTRecord() ? 0 : 1;
}

RowIndex& UNeditDatabase::IndexOf(const nedit::RowSource& rows, int type) {
    std::map<int, RowIndex>& indexes = &rows == Rows ? RowIndexes : OtherRowIndexes;
    if (&rows != Rows && OtherRows != &rows) {
        OtherRowIndexes.clear();
        OtherRows = &rows;
    }
    auto found = indexes.find(type);
    if (found == indexes.end()) {
        std::vector<int> types =
            type == kCoordinateRows ? std::vector<int>{rec::Xyz, rec::Yxz} : std::vector<int>{type};
        found = indexes.emplace(type, RowIndex(*Doc, Names, std::move(types))).first;
    }
    return found->second;
}

int UNeditDatabase::FindCoordinateRow(const nedit::RowSource& rows, const std::wstring& name,
                                      int type, double* e, double* n, double* z) {
    if (Doc == nullptr) return -1;
    const int row = IndexOf(rows, type).Find(rows, name, Fields);
    if (row >= 0 && e != nullptr) {
        *e = Number(fld::E);
        *n = Number(fld::N);
        *z = Number(fld::H);
    }
    // The fields are views into the rows, which the caller may change next.
    Fields.clear();
    return row;
}

int UNeditDatabase::FindXYZ(const std::wstring& name, double& e, double& n, double& z) {
    if (Rows == nullptr) return -1;
    return FindCoordinateRow(*Rows, name, kCoordinateRows, &e, &n, &z);
}

int UNeditDatabase::FindXYZ(const nedit::RowSource& rows, const std::wstring& name, double& e,
                            double& n, double& z) {
    ForgetOtherRows();
    const int row = FindCoordinateRow(rows, name, kCoordinateRows, &e, &n, &z);
    ForgetOtherRows();
    return row;
}

void UNeditDatabase::ForgetOtherRows() {
    OtherRowIndexes.clear();
    OtherRows = nullptr;
}

int UNeditDatabase::FindRecord(int type, const std::wstring& name) {
    // Rows of no known type are never records of a type.
    if (Rows == nullptr || type == rec::None) return -1;
    return FindCoordinateRow(*Rows, name, type, nullptr, nullptr, nullptr);
}

int UNeditDatabase::InsertRow(nedit::RowSource& rows, int row, const std::wstring& text) {
    const std::uint64_t before = rows.GetRevision();
    const int at = rows.AddRecord(row, text);
    if (at >= 0) {
        for (auto& [type, index] : &rows == Rows ? RowIndexes : OtherRowIndexes)
            index.Inserted(rows, at, before);
    }
    return at;
}

int UNeditDatabase::AppendRow(nedit::RowSource& rows, const std::wstring& text) {
    return InsertRow(rows, rows.GetItemCount(), text);
}

void UNeditDatabase::ReplaceRow(nedit::RowSource& rows, int row, const std::wstring& text) {
    const std::uint64_t before = rows.GetRevision();
    const std::string old(rows.GetRowUtf8(row));
    rows.DeleteItem(row);
    if (rows.AddRecord(row, text) != row) return;
    for (auto& [type, index] : &rows == Rows ? RowIndexes : OtherRowIndexes)
        index.Replaced(rows, row, old, before);
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
    if (from.empty()) from = kNameOfNone;
    if (to.empty()) to = kNameOfNone;
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
    if (from.empty()) from = kNameOfNone;
    if (to.empty()) to = kNameOfNone;
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
