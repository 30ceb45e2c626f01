#include "platform/job/USvyCodeLib.h"

#include <cstdio>
#include <fstream>

#include "platform/io/LineReader.h"
#include "platform/io/ReplaceFile.h"
#include "platform/job/Csv.h"
#include "platform/job/JobDatabase.h"
#include "platform/job/UDBSQLiteTransaction.h"
#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"

bool USvyCode::operator==(const USvyCode& other) const {
    return Code == other.Code && Layer == other.Layer && PointMark == other.PointMark &&
           Symbol == other.Symbol && PointColour == other.PointColour &&
           LineType == other.LineType && LineColour == other.LineColour &&
           Thickness == other.Thickness && Description == other.Description &&
           IsString == other.IsString && UseInSurface == other.UseInSurface &&
           LineUseInSurface == other.LineUseInSurface && PointFlag1 == other.PointFlag1 &&
           PointFlag2 == other.PointFlag2 && PointFlag3 == other.PointFlag3 &&
           PointFlag4 == other.PointFlag4;
}

namespace {

// The columns of a library, in the order files and the table use; text members first.
const std::vector<std::pair<const char*, std::wstring USvyCode::*>>& TextColumns() {
    static const std::vector<std::pair<const char*, std::wstring USvyCode::*>> columns = {
        {"code", &USvyCode::Code},          {"description", &USvyCode::Description},
        {"layer", &USvyCode::Layer},        {"point_mark", &USvyCode::PointMark},
        {"symbol", &USvyCode::Symbol},      {"point_colour", &USvyCode::PointColour},
        {"line_type", &USvyCode::LineType}, {"line_colour", &USvyCode::LineColour},
        {"thickness", &USvyCode::Thickness}};
    return columns;
}

const std::vector<std::pair<const char*, int USvyCode::*>>& IntColumns() {
    static const std::vector<std::pair<const char*, int USvyCode::*>> columns = {
        {"is_string", &USvyCode::IsString},
        {"use_in_surface", &USvyCode::UseInSurface},
        {"line_use_in_surface", &USvyCode::LineUseInSurface},
        {"point_flag1", &USvyCode::PointFlag1},
        {"point_flag2", &USvyCode::PointFlag2},
        {"point_flag3", &USvyCode::PointFlag3},
        {"point_flag4", &USvyCode::PointFlag4}};
    return columns;
}

std::wstring Where(const std::string& path, long line) {
    return nedit::FromUtf8(path) + L" line " + std::to_wstring(line) + L": ";
}

}  // namespace

std::wstring USvyCodeLib::Key(std::wstring_view code) {
    return nedit::ToUpper(nedit::Trim(code));
}

int USvyCodeLib::FindSvyCode(const wchar_t* code) const {
    return code != nullptr && GetSvyCode(code) != nullptr ? 1 : 0;
}

const USvyCode* USvyCodeLib::GetSvyCode(std::wstring_view code) const {
    const auto found = index_.find(Key(code));
    return found == index_.end() ? nullptr : &codes_[found->second];
}

bool USvyCodeLib::SetSvyCode(const USvyCode& code) {
    const std::wstring key = Key(code.Code);
    if (key.empty()) return false;
    USvyCode stored = code;
    stored.Code = nedit::Trim(code.Code);
    const auto found = index_.find(key);
    if (found != index_.end()) {
        codes_[found->second] = stored;
    } else {
        index_[key] = codes_.size();
        codes_.push_back(stored);
    }
    modified_ = true;
    return true;
}

bool USvyCodeLib::RemoveSvyCode(std::wstring_view code) {
    const auto found = index_.find(Key(code));
    if (found == index_.end()) return false;
    codes_.erase(codes_.begin() + static_cast<std::ptrdiff_t>(found->second));
    index_.clear();
    for (std::size_t i = 0; i < codes_.size(); ++i) index_[Key(codes_[i].Code)] = i;
    modified_ = true;
    return true;
}

void USvyCodeLib::Clear() {
    codes_.clear();
    index_.clear();
}

bool USvyCodeLib::LoadFile(const std::string& path, std::wstring& error) {
    nedit::LineReader reader;
    if (!reader.Open(path)) {
        error = L"Cannot read the code library " + nedit::FromUtf8(path) + L".";
        return false;
    }
    USvyCodeLib loaded;
    std::vector<int> textSlot;  // per file column: index into TextColumns, or -1
    std::vector<int> intSlot;
    bool haveHeader = false;
    std::string line;
    std::vector<std::string> fields;
    std::string csvError;
    long number = 0;
    while (reader.ReadLine(line)) {
        ++number;
        const std::wstring trimmed = nedit::Trim(nedit::FromUtf8(line));
        if (trimmed.empty() || trimmed[0] == L'#') continue;
        if (!nedit::SplitCsvLine(line, fields, csvError)) {
            error = Where(path, number) + nedit::FromUtf8(csvError) + L".";
            return false;
        }
        if (!haveHeader) {
            bool haveCode = false;
            for (const std::string& field : fields) {
                const std::string name =
                    nedit::ToUtf8(nedit::ToLower(nedit::Trim(nedit::FromUtf8(field))));
                int text = -1;
                int whole = -1;
                for (std::size_t c = 0; c < TextColumns().size(); ++c) {
                    if (name == TextColumns()[c].first) text = static_cast<int>(c);
                }
                for (std::size_t c = 0; c < IntColumns().size(); ++c) {
                    if (name == IntColumns()[c].first) whole = static_cast<int>(c);
                }
                haveCode = haveCode || text == 0;
                textSlot.push_back(text);
                intSlot.push_back(whole);
            }
            if (!haveCode) {
                error =
                    Where(path, number) + L"the first line must name the columns, with \"code\".";
                return false;
            }
            haveHeader = true;
            continue;
        }
        USvyCode code;
        for (std::size_t c = 0; c < fields.size() && c < textSlot.size(); ++c) {
            const std::wstring value = nedit::Trim(nedit::FromUtf8(fields[c]));
            if (textSlot[c] >= 0)
                code.*(TextColumns()[static_cast<std::size_t>(textSlot[c])].second) = value;
            if (intSlot[c] >= 0)
                code.*(IntColumns()[static_cast<std::size_t>(intSlot[c])].second) =
                    nedit::TextToInt(value);
        }
        if (!loaded.SetSvyCode(code)) {
            error = Where(path, number) + L"a code is missing.";
            return false;
        }
    }
    codes_ = std::move(loaded.codes_);
    index_ = std::move(loaded.index_);
    modified_ = false;
    file_ = path;
    job_ = nullptr;
    return true;
}

bool USvyCodeLib::SaveFile(const std::string& path, std::wstring& error) const {
    std::string text;
    for (const auto& column : TextColumns())
        text += std::string(text.empty() ? "" : ",") + column.first;
    for (const auto& column : IntColumns()) text += std::string(",") + column.first;
    text += '\n';
    for (const USvyCode& code : codes_) {
        std::string row;
        for (const auto& column : TextColumns()) {
            if (column.second != &USvyCode::Code) row += ',';
            row += nedit::CsvField(nedit::ToUtf8(code.*column.second));
        }
        for (const auto& column : IntColumns()) row += "," + std::to_string(code.*column.second);
        text += row + '\n';
    }
    if (nedit::ReplaceFile(path, text)) return true;
    error = L"Cannot write the code library " + nedit::FromUtf8(path) + L".";
    return false;
}

void USvyCodeLib::LoadJob(nedit::JobDatabase& job) {
    USvyCodeLib loaded;
    auto query = job.Query(
        "SELECT code, description, layer, point_mark, symbol, point_colour, line_type, "
        "line_colour, thickness, is_string, use_in_surface, line_use_in_surface, point_flag1, "
        "point_flag2, point_flag3, point_flag4 FROM survey_code ORDER BY code");
    while (query->Step()) {
        USvyCode code;
        int column = 0;
        for (const auto& text : TextColumns()) code.*text.second = query->Text(column++);
        for (const auto& whole : IntColumns())
            code.*whole.second = static_cast<int>(query->Int(column++));
        loaded.SetSvyCode(code);
    }
    codes_ = std::move(loaded.codes_);
    index_ = std::move(loaded.index_);
    modified_ = false;
    job_ = &job;
    file_.clear();
}

void USvyCodeLib::SaveJob(nedit::JobDatabase& job) const {
    job.RequireWritable();
    UDBSQLiteTransaction transaction(job);
    job.Query("DELETE FROM survey_code")->Run();
    for (const USvyCode& code : codes_) {
        auto insert = job.Query(
            "INSERT INTO survey_code (code, description, layer, point_mark, symbol, "
            "point_colour, line_type, line_colour, thickness, is_string, use_in_surface, "
            "line_use_in_surface, point_flag1, point_flag2, point_flag3, point_flag4) "
            "VALUES (?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?)");
        int index = 1;
        for (const auto& text : TextColumns()) insert->Bind(index++, code.*text.second);
        for (const auto& whole : IntColumns()) insert->Bind(index++, code.*whole.second);
        insert->Run();
    }
    transaction.Commit();
}

int USvyCodeLib::Save(bool always, bool /*quiet*/) {
    if (!always && !modified_) return 1;
    if (job_ != nullptr) {
        SaveJob(*job_);
    } else if (!file_.empty()) {
        if (!SaveFile(file_, last_error_)) return 0;
    } else {
        last_error_ = L"The code library has no home to be saved in.";
        return 0;
    }
    modified_ = false;
    return 1;
}

int USvyCodeLib::Load() {
    if (job_ != nullptr) {
        LoadJob(*job_);
        return 1;
    }
    if (!file_.empty()) return LoadFile(file_, last_error_) ? 1 : 0;
    last_error_ = L"The code library has no home to be loaded from.";
    return 0;
}
