#include "platform/job/JobTransfers.h"

#include "platform/job/JobDatabase.h"
#include "platform/job/UDBSQLiteTransaction.h"

namespace nedit {

void RecordTransfer(JobDatabase& job, const TransferRecord& record) {
    job.RequireWritable();
    UDBSQLiteTransaction transaction(job);
    {
        auto insert = job.Query(
            "INSERT INTO transfer (made_at, source, points, lines, arcs, circles, polylines, "
            "complete) VALUES (strftime('%Y-%m-%dT%H:%M:%SZ', 'now'), ?, ?, ?, ?, ?, ?, ?)");
        insert->Bind(1, record.Source).Bind(2, record.Points).Bind(3, record.Lines);
        insert->Bind(4, record.Arcs).Bind(5, record.Circles).Bind(6, record.Polylines);
        insert->Bind(7, record.Complete ? 1 : 0).Run();
    }
    const long long id = job.LastInsertId();
    int seq = 0;
    for (const NotWritten& left : record.Left) {
        auto insert = job.Query(
            "INSERT INTO transfer_left (transfer_id, seq, kind, name, reason) VALUES (?, ?, ?, ?, "
            "?)");
        insert->Bind(1, id).Bind(2, ++seq).Bind(3, left.Kind).Bind(4, left.Name);
        insert->Bind(5, left.Reason).Run();
    }
    transaction.Commit();
}

std::vector<TransferRecord> ReadTransfers(JobDatabase& job) {
    std::vector<TransferRecord> records;
    std::vector<long long> ids;
    {
        auto query = job.Query(
            "SELECT id, made_at, source, points, lines, arcs, circles, polylines, complete FROM "
            "transfer ORDER BY id");
        while (query->Step()) {
            TransferRecord record;
            ids.push_back(query->Int(0));
            record.MadeAt = query->Text(1);
            record.Source = query->Text(2);
            record.Points = static_cast<int>(query->Int(3));
            record.Lines = static_cast<int>(query->Int(4));
            record.Arcs = static_cast<int>(query->Int(5));
            record.Circles = static_cast<int>(query->Int(6));
            record.Polylines = static_cast<int>(query->Int(7));
            record.Complete = query->Int(8) != 0;
            records.push_back(record);
        }
    }
    for (std::size_t i = 0; i < records.size(); ++i) {
        auto query = job.Query(
            "SELECT kind, name, reason FROM transfer_left WHERE transfer_id = ? ORDER BY seq");
        query->Bind(1, ids[i]);
        while (query->Step())
            records[i].Left.push_back({query->Text(0), query->Text(1), query->Text(2)});
    }
    return records;
}

}  // namespace nedit
