// sxnedit doc ...: the raw-data documents stored in a job.

#include <cstdio>
#include <memory>
#include <string>
#include <vector>

#include "Commands.h"
#include "ConsoleDialogHost.h"
#include "ReductionOutput.h"
#include "document/UListCtrl.h"
#include "document/URawDataContainer.h"
#include "platform/job/JobError.h"
#include "platform/job/USurveyDoc.h"
#include "platform/settings/DataDirectory.h"
#include "platform/text/WideText.h"
#include "report/NeditIni.h"

namespace {

const char* const kDocUsage =
    "sxnedit: doc takes one of: list JOB, import JOB FILE.neu [--name NAME], export JOB NAME "
    "FILE.neu,\n"
    "reduce JOB NAME [--report OUT|-] [--json], rename JOB OLD NEW, delete JOB NAME (see sxnedit "
    "--help)\n";

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
    if (!wanted.empty() && open.container->GetNeditDoc(Wide(wanted)) != nullptr) {
        std::fprintf(stderr, "sxnedit: the job has a document %s already\n", wanted.c_str());
        return exit_status::Failed;
    }
    std::wstring name;
    if (!open.container->CreateNEditDocFromNeutralFile(Wide(wanted), Wide(file), &name)) {
        std::fprintf(stderr, "sxnedit: %s could not be imported\n", file.c_str());
        return exit_status::Unreadable;
    }
    // The import numbers its names; a name asked for is given exactly.
    if (!wanted.empty() && !open.container->RenameNeditDoc(Wide(wanted), name)) {
        std::fprintf(stderr, "sxnedit: the document could not be named %s\n", wanted.c_str());
        return exit_status::Failed;
    }
    std::printf("Imported %s as %s.\n", file.c_str(),
                wanted.empty() ? nedit::ToUtf8(name).c_str() : wanted.c_str());
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

int Reduce(OpenJob& open, const std::vector<std::string>& args) {
    std::string report;
    bool json = false;
    for (std::size_t i = 2; i < args.size(); ++i) {
        if (args[i] == "--json") {
            json = true;
        } else if (args[i] == "--report" && i + 1 < args.size()) {
            report = args[++i];
        } else {
            std::fputs(kDocUsage, stderr);
            return exit_status::Usage;
        }
    }
    if (!CheckOutputOptions(report, json)) return exit_status::Usage;
    UNeditDoc* doc = Find(open, args[1]);
    if (doc == nullptr) return exit_status::Failed;
    open.host.SetEcho(!json);
    UListCtrl& list = doc->OpenList();
    const int result = doc->SetupDataBase(&list);
    // Addition points went into the rows; they are kept with the document.
    doc->SaveDocument();
    if (!WriteReductionOutput(*doc->GetDatabase(), doc->GetNReport(), report, json,
                              open.host.Messages(), doc->GetSettings().GetLengthDecimals())) {
        return exit_status::Failed;
    }
    return result == 1 ? exit_status::Ok : exit_status::Failed;
}

int Rename(OpenJob& open, const std::string& from, const std::string& to) {
    if (open.container->GetNeditDoc(Wide(to)) != nullptr) {
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

}  // namespace

int RunDoc(const std::vector<std::string>& args) {
    if (args.size() < 2) {
        std::fputs(kDocUsage, stderr);
        return exit_status::Usage;
    }
    const std::string& command = args[0];
    const std::vector<std::string> rest(args.begin() + 1, args.end());
    const std::size_t count = rest.size();
    const bool known = (command == "list" && count == 1) ||
                       (command == "import" && (count == 2 || count == 4)) ||
                       (command == "export" && count == 3) || (command == "reduce" && count >= 2) ||
                       (command == "rename" && count == 3) || (command == "delete" && count == 2);
    if (!known || (command == "import" && count == 4 && rest[2] != "--name")) {
        std::fputs(kDocUsage, stderr);
        return exit_status::Usage;
    }
    OpenJob open;
    if (!Open(rest[0], open)) return exit_status::Unreadable;
    if (command == "list") return List(open);
    if (command == "import") return Import(open, rest[1], count == 4 ? rest[3] : std::string());
    if (command == "export") return Export(open, rest[1], rest[2]);
    if (command == "reduce") return Reduce(open, rest);
    if (command == "rename") return Rename(open, rest[1], rest[2]);
    return Delete(open, rest[1]);
}
