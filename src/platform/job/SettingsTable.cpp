#include "platform/job/SettingsTable.h"

#include "platform/job/JobDatabase.h"
#include "platform/job/UDBSQLiteTransaction.h"

namespace nedit {

std::map<std::wstring, std::wstring> ReadSettings(JobDatabase& job, const std::wstring& section) {
    std::map<std::wstring, std::wstring> values;
    auto query = job.Query("SELECT key, value FROM setting WHERE section = ?");
    query->Bind(1, section);
    while (query->Step()) values[query->Text(0)] = query->Text(1);
    return values;
}

std::wstring ReadSetting(JobDatabase& job, const std::wstring& section, const std::wstring& key,
                         const std::wstring& fallback) {
    auto query = job.Query("SELECT value FROM setting WHERE section = ? AND key = ?");
    query->Bind(1, section).Bind(2, key);
    return query->Step() ? query->Text(0) : fallback;
}

void WriteSettings(JobDatabase& job, const std::wstring& section,
                   const std::map<std::wstring, std::wstring>& values) {
    job.RequireWritable();
    UDBSQLiteTransaction transaction(job);
    for (const auto& [key, value] : values) {
        auto write = job.Query(
            "INSERT INTO setting (section, key, value) VALUES (?, ?, ?) "
            "ON CONFLICT (section, key) DO UPDATE SET value = excluded.value");
        write->Bind(1, section).Bind(2, key).Bind(3, value).Run();
    }
    transaction.Commit();
}

}  // namespace nedit
