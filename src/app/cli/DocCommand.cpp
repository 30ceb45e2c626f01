// sxnedit doc ...: the raw-data documents stored in a job.

#include <CLI/CLI.hpp>
#include <cstdio>
#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "Commands.h"
#include "ConsoleDialogHost.h"
#include "ReductionOutput.h"
#include "RunFiles.h"
#include "SurveyTransfer.h"
#include "TraverseOptions.h"
#include "TraverseRun.h"
#include "document/UListCtrl.h"
#include "document/URawDataContainer.h"
#include "platform/job/JobError.h"
#include "platform/job/USurveyDoc.h"
#include "platform/settings/DataDirectory.h"
#include "platform/text/WideText.h"
#include "report/NeditIni.h"
#include "report/UNeditReport.h"

namespace {

std::wstring Wide(const std::string& text) {
    return nedit::FromUtf8(text);
}

/// A job opened with its raw-data container.
struct OpenJob {
    std::unique_ptr<USurveyDoc> job;
    std::unique_ptr<URawDataContainer> container;
    ConsoleDialogHost host;
};

bool Open(const std::string& path, OpenJob& open) {
    try {
        open.job = USurveyDoc::OpenJob(path);
    } catch (const nedit::JobError& error) {
        std::fprintf(stderr, "sxnedit: %s\n", error.what());
        return false;
    }
    nedit::InstallDefaultNeditIni(nedit::DataDirectory());
    open.container = std::make_unique<URawDataContainer>(open.job.get());
    if (open.container->Open()) return true;
    std::fprintf(stderr, "sxnedit: the raw-data documents of %s cannot be opened\n", path.c_str());
    return false;
}

UNeditDoc* Find(OpenJob& open, const std::string& name) {
    UNeditDoc* doc = open.container->GetNeditDoc(Wide(name));
    if (doc == nullptr) std::fprintf(stderr, "sxnedit: the job has no document %s\n", name.c_str());
    if (doc != nullptr) doc->SetDialogHost(&open.host);
    return doc;
}

int List(OpenJob& open) {
    for (const std::wstring& name : open.container->GetDocumentNames()) {
        std::printf("%s\n", nedit::ToUtf8(name).c_str());
    }
    return exit_status::Ok;
}

int Import(OpenJob& open, const std::string& file, const std::string& wanted) {
    std::wstring name = Wide(wanted);
    const int done = wanted.empty()
                         ? open.container->CreateNEditDocFromNeutralFile(L"", Wide(file), &name)
                         : open.container->CreateNEditDocNamed(name, Wide(file));
    if (!done && !wanted.empty() && open.container->HasName(name)) {
        std::fprintf(stderr, "sxnedit: the job has a document %s already\n", wanted.c_str());
        return exit_status::Failed;
    }
    if (!done) {
        std::fprintf(stderr, "sxnedit: %s could not be imported\n", file.c_str());
        return exit_status::Unreadable;
    }
    std::printf("Imported %s as %s.\n", file.c_str(), nedit::ToUtf8(name).c_str());
    return exit_status::Ok;
}

int Export(OpenJob& open, const std::string& name, const std::string& file) {
    UNeditDoc* doc = Find(open, name);
    if (doc == nullptr) return exit_status::Failed;
    if (!doc->Save(Wide(file), &doc->OpenList())) {
        std::fprintf(stderr, "sxnedit: cannot write %s\n", file.c_str());
        return exit_status::Failed;
    }
    return exit_status::Ok;
}

int Reduce(OpenJob& open, const std::string& name, const std::string& report, bool json) {
    UNeditDoc* doc = Find(open, name);
    if (doc == nullptr) return exit_status::Failed;
    open.host.SetEcho(!json);
    // The report takes part in the reduction; its text is kept only when it is asked for.
    if (doc->GetNReport() != nullptr) doc->GetNReport()->SetKeepText(!report.empty());
    UListCtrl& list = doc->OpenList();
    const int result = doc->SetupDataBase(&list);
    // Addition points went into the rows; they are kept with the document.
    doc->SaveDocument();
    ReductionOutputs outputs;
    outputs.report = report;
    outputs.json = json;
    outputs.decimals = doc->GetSettings().GetLengthDecimals();
    const int status =
        WriteReductionOutput(*doc->GetDatabase(), doc->GetNReport(), outputs, open.host);
    if (status != exit_status::Ok) return status;
    return result == 1 ? exit_status::Ok : exit_status::Failed;
}

int Traverse(OpenJob& open, const std::string& name, const TraverseOptions& options) {
    TraverseRequest request;
    if (!ReadRequest(options, request)) return exit_status::Unreadable;
    UNeditDoc* doc = Find(open, name);
    if (doc == nullptr) return exit_status::Failed;
    open.host.SetEcho(!options.json);
    UListCtrl& list = doc->OpenList();
    doc->SetupDataBase(&list);
    const TraverseOutcome outcome =
        RunTraverse(*doc->GetDatabase(), doc->GetTraverseRoutes(), open.host, request);
    // Stored as the pane stores it after a traverse: adjusted points into the rows first.
    if (!doc->SaveDocument()) {
        std::fprintf(stderr, "sxnedit: the document %s could not be stored\n", name.c_str());
        return exit_status::Failed;
    }
    const int status = WriteTraverseOutput(outcome, doc->GetNReport(), options, open.host,
                                           doc->GetSettings().GetLengthDecimals());
    if (!options.save.empty() && !doc->Save(Wide(options.save), &list)) {
        std::fprintf(stderr, "sxnedit: cannot write %s\n", options.save.c_str());
        return exit_status::Failed;
    }
    return status;
}

int Transfer(OpenJob& open, const std::string& name, const SurveyTransferOptions& options) {
    UNeditDoc* doc = Find(open, name);
    if (doc == nullptr) return exit_status::Failed;
    open.host.SetEcho(!options.json);
    open.host.SetInteractive(options.interactive);
    UListCtrl& list = doc->OpenList();
    const int reduced = doc->SetupDataBase(&list);
    // Addition points went into the rows; they are kept with the document.
    doc->SaveDocument();
    if (reduced != 1) {
        std::fprintf(stderr,
                     "sxnedit: the reduction of %s did not reach its end; nothing was saved to "
                     "the job\n",
                     name.c_str());
        return exit_status::Failed;
    }
    return SaveToSurvey(*doc, *doc->GetDatabase(), open.host, options);
}

int Rename(OpenJob& open, const std::string& from, const std::string& to) {
    if (open.container->HasName(Wide(to))) {
        std::fprintf(stderr, "sxnedit: the job has a document %s already\n", to.c_str());
        return exit_status::Failed;
    }
    if (Find(open, from) == nullptr) return exit_status::Failed;
    if (!open.container->RenameNeditDoc(Wide(to), Wide(from))) {
        std::fprintf(stderr, "sxnedit: %s could not be renamed\n", from.c_str());
        return exit_status::Failed;
    }
    return exit_status::Ok;
}

int Delete(OpenJob& open, const std::string& name) {
    if (Find(open, name) == nullptr) return exit_status::Failed;
    return open.container->DeleteNeditDoc(Wide(name)) ? exit_status::Ok : exit_status::Failed;
}

/// The words of every doc command; each command binds the ones it takes.
struct DocOptions {
    std::string job;
    std::string name;
    std::string other;   // the neutral file of an import, the new name of a rename
    std::string output;  // the file of an export, the report of a reduction
    bool json = false;
    TraverseOptions traverse;
    SurveyTransferOptions transfer;
};

/// A doc command that opens the job and then does `work` on it.
CLI::App* AddDocCommand(CLI::App& doc, CommandRun& run, const std::shared_ptr<DocOptions>& options,
                        const char* name, const char* description,
                        std::function<int(OpenJob&, const DocOptions&)> work) {
    CLI::App* command = doc.add_subcommand(name, description);
    command->add_option("JOB", options->job, "the job file")->required();
    command->callback([options, work, &run] {
        run = [options, work] {
            if (!RunFiles()
                     .Reads(options->job)
                     .Reads(options->traverse.params)
                     .Writes(options->output)
                     .Writes(options->traverse.report)
                     .Writes(options->traverse.save)
                     .Check()) {
                return exit_status::Failed;
            }
            OpenJob open;
            if (!Open(options->job, open)) return exit_status::Unreadable;
            return work(open, *options);
        };
    });
    return command;
}

}  // namespace

void AddDocCommands(CLI::App& app, CommandRun& run) {
    auto options = std::make_shared<DocOptions>();
    CLI::App* doc = app.add_subcommand("doc", "the raw-data documents stored in a job");
    doc->require_subcommand(1);

    AddDocCommand(*doc, run, options, "list", "the raw-data documents stored in a job",
                  [](OpenJob& open, const DocOptions&) { return List(open); });

    CLI::App* import = AddDocCommand(
        *doc, run, options, "import", "store a neutral file in the job as a raw-data document",
        [](OpenJob& open, const DocOptions& o) { return Import(open, o.other, o.name); });
    import->add_option("FILE.neu", options->other, "the neutral file")->required();
    import->add_option("--name", options->name, "the document's name (else Data1, Data2, ...)")
        ->option_text("NAME");

    CLI::App* exported = AddDocCommand(
        *doc, run, options, "export", "write a document's records as a neutral file",
        [](OpenJob& open, const DocOptions& o) { return Export(open, o.name, o.output); });
    exported->add_option("NAME", options->name, "the document")->required();
    exported->add_option("FILE.neu", options->output, "the neutral file to write")->required();

    CLI::App* reduce = AddDocCommand(
        *doc, run, options, "reduce",
        "reduce a stored document; coordinates that the run took\n"
        "from the job or the user are added to its records",
        [](OpenJob& open, const DocOptions& o) { return Reduce(open, o.name, o.output, o.json); });
    reduce->add_option("NAME", options->name, "the document")->required();
    reduce->add_option("--report", options->output, "write the reduction report; - prints it")
        ->option_text("OUT.txt|-");
    reduce->add_flag("--json", options->json, "print the reduction's results as JSON");
    reduce->parse_complete_callback(
        [options] { CheckOutputOptions(options->output, options->json); });

    CLI::App* traverse = AddDocCommand(
        *doc, run, options, "traverse",
        "reduce a stored document, adjust a traverse as 'traverse\n"
        "adjust' does, and store the document",
        [](OpenJob& open, const DocOptions& o) { return Traverse(open, o.name, o.traverse); });
    traverse->add_option("NAME", options->name, "the document")->required();
    AddTraverseOptions(*traverse, options->traverse);
    traverse->parse_complete_callback(
        [options] { CheckOutputOptions(options->traverse.report, options->traverse.json); });

    CLI::App* transfer = AddDocCommand(
        *doc, run, options, "transfer",
        "reduce a stored document and save its points, lines,\n"
        "arcs, circles and strings to the job (\"Save To Survey\")",
        [](OpenJob& open, const DocOptions& o) { return Transfer(open, o.name, o.transfer); });
    transfer->add_option("NAME", options->name, "the document")->required();
    AddSurveyTransferOptions(*transfer, options->transfer);

    CLI::App* rename = AddDocCommand(
        *doc, run, options, "rename", "give a document another name",
        [](OpenJob& open, const DocOptions& o) { return Rename(open, o.name, o.other); });
    rename->add_option("OLD", options->name, "the document")->required();
    rename->add_option("NEW", options->other, "its new name")->required();

    CLI::App* remove =
        AddDocCommand(*doc, run, options, "delete", "delete a document from the job",
                      [](OpenJob& open, const DocOptions& o) { return Delete(open, o.name); });
    remove->add_option("NAME", options->name, "the document")->required();
}
