#pragma once
// The job's settings table: text values by section and key. Job settings, code settings and
// the point counter live here, so that adding a setting never needs a schema change.

#include <map>
#include <string>

namespace nedit {

class JobDatabase;

/// Every key of a section with its value.
std::map<std::wstring, std::wstring> ReadSettings(JobDatabase& job, const std::wstring& section);
/// The value, or `fallback` when the key is not stored.
std::wstring ReadSetting(JobDatabase& job, const std::wstring& section, const std::wstring& key,
                         const std::wstring& fallback = L"");
/// Writes all pairs in one transaction.
void WriteSettings(JobDatabase& job, const std::wstring& section,
                   const std::map<std::wstring, std::wstring>& values);

}  // namespace nedit
