#include "exports/JobCrs.h"

#include <cctype>
#include <cstdlib>

#include "platform/job/SettingsTable.h"
#include "platform/text/WideText.h"

namespace nedit {

namespace {

constexpr const wchar_t* kSection = L"Coordinate System";
constexpr const wchar_t* kKey = L"CRS";
constexpr std::size_t kPrefixSize = 5;  // "EPSG:"

}  // namespace

std::string ReadJobCrs(JobDatabase& job) {
    return ToUtf8(ReadSetting(job, kSection, kKey));
}

void WriteJobCrs(JobDatabase& job, const std::string& crs) {
    WriteSettings(job, kSection, {{kKey, FromUtf8(crs)}});
}

bool IsEpsgCode(const std::string& crs) {
    if (crs.size() <= kPrefixSize || crs.size() > kPrefixSize + 9) return false;
    if (!EqualsIgnoreCase(FromUtf8(crs.substr(0, kPrefixSize)), L"EPSG:")) return false;
    for (std::size_t i = kPrefixSize; i < crs.size(); ++i) {
        if (std::isdigit(static_cast<unsigned char>(crs[i])) == 0) return false;
    }
    return true;
}

int EpsgNumber(const std::string& crs) {
    return IsEpsgCode(crs) ? std::atoi(crs.c_str() + kPrefixSize) : 0;
}

}  // namespace nedit
