#include "Transfer.h"

#include <unistd.h>

#include <CLI/CLI.hpp>
#include <chrono>
#include <cstdio>
#include <map>

#include "Commands.h"
#include "document/UListCtrl.h"
#include "document/URawDataContainer.h"
#include "instruments/UDeviceManager.h"
#include "platform/job/JobError.h"
#include "platform/job/USurveyDoc.h"
#include "platform/settings/DataDirectory.h"
#include "platform/text/WideText.h"
#include "report/NeditIni.h"
#include "sxnedit_driver.h"

namespace {

volatile std::sig_atomic_t g_interrupted = 0;

void OnInterrupt(int) {
    g_interrupted = 1;
}

void Error(const std::string& text) {
    std::fprintf(stderr, "sxnedit: %s\n", text.c_str());
}

}  // namespace

void AddTransferOptions(CLI::App& command, TransferOptions& options) {
    command.add_option("--instrument", options.instrument, "the instrument's driver")
        ->required()
        ->option_text("NAME");
    CLI::Option* output =
        command.add_option("-o", options.output, "write the records into this neutral file")
            ->option_text("OUT.neu");
    CLI::Option* job =
        command.add_option("--job", options.job, "store the records as a new document of JOB")
            ->option_text("JOB")
            ->excludes(output);
    command.add_option("--name", options.name, "the new document's name (else Data1, Data2, ...)")
        ->option_text("DOC")
        ->needs(job);
    const std::map<std::string, int> angles = {{"dms", 0}, {"deg", 1}, {"gon", 2}};
    const std::map<std::string, int> lengths = {{"m", 0}, {"ft", 1}, {"usft", 2}};
    command.add_option("--angles", options.angles, "the records' angle unit (else the job's)")
        ->transform(CLI::CheckedTransformer(angles))
        ->option_text("dms|deg|gon");
    command.add_option("--lengths", options.lengths, "the records' length unit (else the job's)")
        ->transform(CLI::CheckedTransformer(lengths))
        ->option_text("m|ft|usft");
}

bool CheckTransferFiles(const TransferOptions& options, RunFiles files) {
    return files.Reads(options.job).Writes(options.output).Check();
}

TransferTarget::TransferTarget() = default;

TransferTarget::~TransferTarget() {
    // The document goes before the container and the job it lives in.
    Document.reset();
}

UListCtrl& TransferTarget::List() {
    return Document->OpenList();
}

UDeviceManager& TransferTarget::Manager() {
    return *Document->GetDeviceManager();
}

int TransferTarget::Open(const TransferOptions& options) {
    if (!options.job.empty()) {
        try {
            Job = USurveyDoc::OpenJob(options.job);
        } catch (const nedit::JobError& error) {
            Error(error.what());
            return exit_status::Unreadable;
        }
        Container = std::make_unique<URawDataContainer>(Job.get());
        if (!Container->Open()) {
            Error("the raw-data documents of " + options.job + " cannot be opened");
            return exit_status::Failed;
        }
        Name = options.name.empty() ? Container->GetUntitledName() : nedit::FromUtf8(options.name);
        if (Container->GetNeditDoc(Name) != nullptr) {
            Error("the job has a document " + nedit::ToUtf8(Name) + " already");
            return exit_status::Failed;
        }
    }
    nedit::InstallDefaultNeditIni(nedit::DataDirectory());
    Document = std::make_unique<UNeditDoc>(Job.get());
    Document->SetDialogHost(&ConsoleHost);
    if (!Document->IsKeysInitialised()) {
        Error("the record definition could not be loaded: " +
              nedit::ToUtf8(Document->LastDefinitionError()));
        return exit_status::Failed;
    }
    unsigned mode = Document->GetImportMode();
    if (options.angles >= 0) mode = (mode & ~7u) | (1u << options.angles);
    if (options.lengths >= 0) mode = (mode & ~56u) | (SXN_MODE_METRES << options.lengths);
    Document->SetImportMode(mode);
    return LoadDriver(Manager(), options.instrument);
}

int LoadDriver(UDeviceManager& manager, const std::string& instrument) {
    if (manager.LoadDLL(nedit::FromUtf8(instrument))) return exit_status::Ok;
    std::vector<std::wstring> names;
    manager.GetNameList(names);
    std::wstring known;
    for (const std::wstring& name : names) known += (known.empty() ? L"" : L", ") + name;
    Error(nedit::ToUtf8(manager.GetLastError()) + " The drivers are: " +
          (known.empty() ? "none, in " + manager.Catalogue().Directory() : nedit::ToUtf8(known)) +
          ".");
    return exit_status::Failed;
}

int TransferTarget::Deliver(const TransferOptions& options, const std::string& verb,
                            const std::string& source) {
    UListCtrl& list = List();
    if (!options.output.empty()) {
        if (Document->Save(nedit::FromUtf8(options.output), &list)) return exit_status::Ok;
        Error("cannot write " + options.output);
        return exit_status::Failed;
    }
    if (Container) {
        if (!Document->CreateDocument(Name, Container.get()) || !Document->SaveDocument()) {
            Error("the document " + nedit::ToUtf8(Name) + " could not be stored in " + options.job);
            return exit_status::Failed;
        }
        std::printf("%s %s as %s (%d records).\n", verb.c_str(), source.c_str(),
                    nedit::ToUtf8(Name).c_str(), list.GetItemCount());
        return exit_status::Ok;
    }
    for (int row = 0; row < list.GetItemCount(); ++row) {
        const std::string_view text = list.GetRowUtf8(row);
        std::fwrite(text.data(), 1, text.size(), stdout);
        std::fputc('\n', stdout);
    }
    return std::fflush(stdout) == 0 ? exit_status::Ok : exit_status::Failed;
}

TerminalProgress::TerminalProgress(const UListCtrl& list, const UDeviceManager& manager)
    : List(list), Manager(manager), Terminal(isatty(STDERR_FILENO) != 0) {
    g_interrupted = 0;
    struct sigaction action {};
    action.sa_handler = &OnInterrupt;
    sigemptyset(&action.sa_mask);
    sigaction(SIGINT, &action, &Previous);
}

TerminalProgress::~TerminalProgress() {
    sigaction(SIGINT, &Previous, nullptr);
    if (Shown) std::fputc('\n', stderr);
}

bool TerminalProgress::Interrupted() const {
    return g_interrupted != 0;
}

void TerminalProgress::Update(int, const std::wstring& text) {
    if (Interrupted()) RequestAbort();
    if (!Terminal || text.empty()) return;
    const long long now = std::chrono::duration_cast<std::chrono::milliseconds>(
                              std::chrono::steady_clock::now().time_since_epoch())
                              .count();
    if (Shown && now - LastShown < 200) return;
    LastShown = now;
    Shown = true;
    std::fprintf(stderr, "\r%s: %d records, %lld bytes (Ctrl-C stops)  ",
                 nedit::ToUtf8(text).c_str(), List.GetItemCount(), Manager.GetBytesReceived());
    std::fflush(stderr);
}
