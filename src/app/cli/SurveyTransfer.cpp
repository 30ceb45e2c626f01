#include "SurveyTransfer.h"

#include <CLI/CLI.hpp>
#include <cstdio>
#include <vector>

#include "Commands.h"
#include "ConsoleDialogHost.h"
#include "JsonLayout.h"
#include "codes/UNeditPt.h"
#include "document/UNeditDoc.h"
#include "platform/job/UDBSQLiteTransaction.h"
#include "platform/job/USurveyDoc.h"
#include "platform/text/WideText.h"
#include "transfer/DuplicatePtsDlg.h"
#include "transfer/LockedLayersQuestion.h"
#include "transfer/UOverridePolyDlg.h"

namespace {

using nedit::TransferEnd;
using nedit::TransferReport;
namespace mb = nedit::mb;

const char* const kPrefixAnswer = "prefix=";

bool StartsWith(const std::string& text, const char* start) {
    return text.rfind(start, 0) == 0;
}

std::string Utf8(const std::wstring& text) {
    return nedit::ToUtf8(text);
}

// Answers the questions as the options say; records those that nothing answers.
class Answers {
  public:
    Answers(ConsoleDialogHost& host, const SurveyTransferOptions& options)
        : Host(host), Options(options) {
        host.SetFace<DuplicatePtsDlg>(
            [this](DuplicatePtsDlg& dialog) { return Duplicate(dialog); });
        host.SetFace<UOverridePolyDlg>(
            [this](UOverridePolyDlg& dialog) { return Override(dialog); });
        host.SetFace<nedit::LockedLayersQuestion>(
            [this](nedit::LockedLayersQuestion& question) { return Layers(question); });
    }

    const std::vector<std::string>& Conflicts() const { return Unanswered; }

  private:
    int Duplicate(DuplicatePtsDlg& dialog) {
        const std::string& existing = Options.existing;
        const std::string name = Utf8(dialog.GetPoint().GetID());
        if (existing.empty()) {
            if (Options.interactive) return Host.AskDuplicatePoint(dialog);
            Unanswered.push_back("point " + name +
                                 ": the job holds it with other coordinates (--existing)");
            return mb::IdOk;
        }
        if (existing == "abort") return mb::IdCancel;
        dialog.ApplyAll = true;
        if (existing == "overwrite") dialog.Choose(DuplicatePtsDlg::kOverwrite);
        if (existing == "renumber") dialog.Choose(DuplicatePtsDlg::kNewNumber);
        if (StartsWith(existing, kPrefixAnswer)) {
            dialog.Choose(DuplicatePtsDlg::kPrefix);
            dialog.Prefix = nedit::FromUtf8(existing.substr(std::string(kPrefixAnswer).size()));
        }
        if (dialog.OnOK()) return dialog.EndCode();
        Unanswered.push_back("point " + name + ": " + Utf8(dialog.Refusal()) + " (--existing)");
        return mb::IdCancel;
    }

    int Override(UOverridePolyDlg& dialog) {
        if (Options.replacePolylines.empty()) {
            if (Options.interactive) return Host.AskOverrideString(dialog);
            Unanswered.push_back("string " + Utf8(dialog.GetName()) +
                                 ": the job holds a polyline of that name (--replace-polylines)");
            return dialog.OnNo();
        }
        dialog.ApplyAll = true;
        return Options.replacePolylines == "yes" ? dialog.OnYes() : dialog.OnNo();
    }

    int Layers(nedit::LockedLayersQuestion& question) {
        if (Options.unlockLayers.empty()) {
            if (Options.interactive) return Host.AskLockedLayers(question);
            std::string names;
            for (const std::wstring& layer : question.GetLayers())
                names += (names.empty() ? "" : ", ") + Utf8(layer);
            Unanswered.push_back("layers " + names + ": locked in the job (--unlock-layers)");
            return mb::IdOk;
        }
        return Options.unlockLayers == "yes" ? mb::IdOk : mb::IdCancel;
    }

    ConsoleDialogHost& Host;
    const SurveyTransferOptions& Options;
    std::vector<std::string> Unanswered;
};

const char* ResultWord(TransferEnd end) {
    switch (end) {
        case TransferEnd::Finished:
            return "done";
        case TransferEnd::Aborted:
            return "aborted";
        case TransferEnd::Failed:
            return "failed";
        case TransferEnd::Declined:
            return "declined";
        case TransferEnd::NotRun:
            break;
    }
    return "nothing";
}

std::string Json(const TransferReport& report, const char* result,
                 const std::vector<std::string>& conflicts,
                 const std::vector<std::wstring>& messages) {
    const json::Value written = {{"points", report.PointsAdded + report.PointsUpdated},
                                 {"lines", report.LinesAdded + report.LinesUpdated},
                                 {"arcs", report.ArcsAdded + report.ArcsUpdated},
                                 {"circles", report.Circles},
                                 {"polylines", report.PolylinesAdded + report.PolylinesReplaced}};
    const json::Value updated = {{"points", report.PointsUpdated},
                                 {"lines", report.LinesUpdated},
                                 {"arcs", report.ArcsUpdated},
                                 {"polylines", report.PolylinesReplaced}};
    std::vector<json::Value> renamed;
    for (const nedit::RenamedPoint& point : report.Renamed)
        renamed.push_back({{"id", json::Text(point.Id)}, {"job", json::Text(point.JobName)}});
    std::vector<json::Value> left;
    for (const nedit::NotWritten& object : report.Left) {
        left.push_back({{"kind", json::Text(object.Kind)},
                        {"name", json::Text(object.Name)},
                        {"reason", json::Text(object.Reason)}});
    }
    json::Value locked = json::Value::array();
    for (const std::wstring& name : report.LockedRewritten) locked.push_back(json::Text(name));
    json::Value questions = json::Value::array();
    for (const std::string& conflict : conflicts) questions.push_back(conflict);
    json::Value said = json::Value::array();
    for (const std::wstring& message : messages) said.push_back(json::Text(message));
    return json::Members({{"result", json::Inline(result)},
                          {"written", json::Inline(written)},
                          {"updated", json::Inline(updated)},
                          {"renamed", json::Rows(renamed, 2)},
                          {"locked_rewritten", json::Inline(locked)},
                          {"not_written", json::Rows(left, 2)},
                          {"conflicts", json::Inline(questions)},
                          {"messages", json::Inline(said)}}) +
           "\n";
}

std::string Counts(const TransferReport& report, const std::string& job) {
    char line[512];
    std::snprintf(line, sizeof line,
                  "Written to %s: points %d (%d updated), lines %d (%d updated), arcs %d (%d "
                  "updated), circles %d, polylines %d (%d replaced).\n",
                  job.c_str(), report.PointsAdded + report.PointsUpdated, report.PointsUpdated,
                  report.LinesAdded + report.LinesUpdated, report.LinesUpdated,
                  report.ArcsAdded + report.ArcsUpdated, report.ArcsUpdated, report.Circles,
                  report.PolylinesAdded + report.PolylinesReplaced, report.PolylinesReplaced);
    std::string text = line;
    for (const nedit::RenamedPoint& point : report.Renamed)
        text += "Point " + Utf8(point.Id) + " was written as " + Utf8(point.JobName) + ".\n";
    return text;
}

}  // namespace

void AddSurveyTransferOptions(CLI::App& command, SurveyTransferOptions& options) {
    command
        .add_option("--existing", options.existing,
                    "a point the job holds with other coordinates: overwrite\n"
                    "it, create it with the prefix TEXT or a new number, or\n"
                    "abort the transfer")
        ->check(CLI::IsMember({"overwrite", "renumber", "abort"}) |
                CLI::Validator(
                    [](std::string& text) {
                        return StartsWith(text, kPrefixAnswer) ? std::string()
                                                               : std::string("not prefix=TEXT");
                    },
                    "prefix=TEXT"))
        ->option_text("overwrite|prefix=TEXT|renumber|abort");
    command
        .add_option("--replace-polylines", options.replacePolylines,
                    "a polyline of a string's name in the job: replace it\n"
                    "(keeping its identifier), or keep it and add another")
        ->check(CLI::IsMember({"yes", "no"}))
        ->option_text("yes|no");
    command
        .add_option("--unlock-layers", options.unlockLayers,
                    "layers the codes name are locked: unlock them, or stop")
        ->check(CLI::IsMember({"yes", "no"}))
        ->option_text("yes|no");
    command.add_flag("--interactive", options.interactive,
                     "ask the questions no option answers on the terminal");
    command.add_flag("--json", options.json, "print what was written, left out and said as JSON");
}

int SaveToSurvey(UNeditDoc& doc, const UNeditDatabase& engine, ConsoleDialogHost& host,
                 const SurveyTransferOptions& options, const std::wstring& source) {
    USurveyDoc* job = doc.GetSurveyDoc();
    Answers answers(host, options);
    host.SetInteractive(options.interactive);
    host.SetEcho(false);
    const std::size_t said = host.Messages().size();
    UDBSQLiteTransaction transaction(job);
    doc.TransferToJob(engine, source);
    TransferReport report = doc.GetTransferReport();
    const std::vector<std::string>& conflicts = answers.Conflicts();
    std::vector<std::wstring> messages(host.Messages().begin() + static_cast<std::ptrdiff_t>(said),
                                       host.Messages().end());
    const char* result = ResultWord(report.End);
    if (!conflicts.empty()) {
        transaction.Rollback();
        report.Undone();
        result = "conflicts";
        messages.clear();
    } else {
        transaction.Commit();
    }
    if (options.json) {
        const std::string out = Json(report, result, conflicts, messages);
        std::fwrite(out.data(), 1, out.size(), stdout);
    } else {
        for (const std::wstring& message : messages)
            std::fprintf(stderr, "sxnedit: %s\n", Utf8(message).c_str());
        if (report.Kept) std::fputs(Counts(report, job->GetPathName()).c_str(), stdout);
    }
    if (!conflicts.empty()) {
        std::fprintf(stderr, "sxnedit: nothing was written: %zu questions need an answer:\n",
                     conflicts.size());
        for (const std::string& conflict : conflicts)
            std::fprintf(stderr, "  %s\n", conflict.c_str());
        return exit_status::Failed;
    }
    return report.End == TransferEnd::Finished && report.Kept ? exit_status::Ok
                                                              : exit_status::Failed;
}
