#pragma once
// The transfers into a job ("Save To Survey") as the job keeps them: when, from what, how many
// objects of each kind were written, whether the transfer came to its end, and everything it
// left out with the reason. Written inside the transfer's own transaction, so the job holds a
// transfer's record exactly when it holds what the transfer wrote.

#include <string>
#include <vector>

namespace nedit {

class JobDatabase;

/// An object that did not reach the job: its kind ("point", "line", "arc", "circle",
/// "string", "images", "attributes", "note"), its name as the reduction knows it, and why.
struct NotWritten {
    std::wstring Kind;
    std::wstring Name;
    std::wstring Reason;
};

struct TransferRecord {
    std::wstring MadeAt;  // UTC, YYYY-MM-DDTHH:MM:SSZ; set when it is stored
    std::wstring Source;  // the raw-data document or file
    int Points = 0;
    int Lines = 0;
    int Arcs = 0;
    int Circles = 0;
    int Polylines = 0;
    bool Complete = true;
    std::vector<NotWritten> Left;
};

/// Stores `record`, stamped with the time now. Throws JobError as any write.
void RecordTransfer(JobDatabase& job, const TransferRecord& record);
/// Every transfer the job keeps, oldest first.
std::vector<TransferRecord> ReadTransfers(JobDatabase& job);

}  // namespace nedit
