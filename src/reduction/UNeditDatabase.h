#pragma once
// The reduction engine of one raw-data document. It reads the document's records, and will
// reduce them to coordinates; this header grows with each stage of the run.

#include <functional>
#include <string>

class UListCtrl;
class UNeutralFileFormat;

namespace nedit {
class DialogHost;
class ProgressSink;
}  // namespace nedit

class UNeditDatabase {
public:
    /// The format service, the record list, the host that shows messages and the progress
    /// sink may each be null; the engine then does without them.
    UNeditDatabase(UNeutralFileFormat* format, UListCtrl* list, nedit::DialogHost* host,
                   nedit::ProgressSink* progress = nullptr);
    virtual ~UNeditDatabase();
    UNeditDatabase(const UNeditDatabase&) = delete;
    UNeditDatabase& operator=(const UNeditDatabase&) = delete;

    /// Reads a neutral text file (UTF-8 path) into the record list, clearing it first.
    /// Gives 1 when the list holds at least one row afterwards, else 0. Shows
    /// "Failed to open {1}." or "Neutral file header not found." when it cannot read.
    int LoadNeFile(const std::wstring& path);

    /// The angle type of the current angular unit letter: 1 decimal degrees, 2 gons, else 0.
    int GetAngleType() const;
    wchar_t GetAngleUnit() const { return angle_unit_; }
    void SetAngleUnit(wchar_t unit) { angle_unit_ = unit; }

    /// The pane, when there is one, learns the angle type of each unit record read.
    void SetAngleTypeHandler(std::function<void(int)> handler) { angle_type_handler_ = std::move(handler); }

    /// A report is wanted from the next run.
    bool GetOutput() const { return output_; }
    void SetOutput(bool output) { output_ = output; }

    UListCtrl* GetListCtrl() const { return list_; }

private:
    UNeutralFileFormat* format_;
    UListCtrl* list_;
    nedit::DialogHost* host_;
    nedit::ProgressSink* progress_;
    std::function<void(int)> angle_type_handler_;
    wchar_t angle_unit_ = L'S';
    bool output_ = false;
};
