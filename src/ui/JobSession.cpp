#include "ui/JobSession.h"

#include <filesystem>
#include <fstream>

#include "document/URawDataContainer.h"
#include "platform/job/JobError.h"
#include "platform/job/USurveyDoc.h"
#include "platform/job/USvyCodeLib.h"
#include "platform/settings/DataDirectory.h"
#include "platform/text/WideText.h"
#include "records/RecordTypes.h"
#include "report/NeditIni.h"

namespace nedit {

JobSession::JobSession() = default;

JobSession::~JobSession() {
    Close();
}

void JobSession::Close() {
    container_.reset();
    job_.reset();
    path_.clear();
}

bool JobSession::Adopt(std::unique_ptr<USurveyDoc> job, const std::string& path,
                       std::wstring& error) {
    InstallDefaultNeditIni(DataDirectory());
    auto container = std::make_unique<URawDataContainer>(job.get());
    if (!container->Open()) {
        error = L"The raw-data documents of " + FromUtf8(path) + L" cannot be opened.";
        return false;
    }
    Close();
    job_ = std::move(job);
    container_ = std::move(container);
    path_ = path;
    return true;
}

bool JobSession::Open(const std::string& path, std::wstring& error) {
    try {
        return Adopt(USurveyDoc::OpenJob(path), path, error);
    } catch (const JobError& failure) {
        error = FromUtf8(failure.what());
        return false;
    }
}

bool JobSession::Create(const std::string& path, std::wstring& error) {
    USvyCodeLib codes;
    std::wstring codes_error;
    const bool have_codes = codes.LoadFile(DataDirectory() + "/SurveyCodes.csv", codes_error);
    try {
        return Adopt(USurveyDoc::CreateJob(path, have_codes ? &codes : nullptr), path, error);
    } catch (const JobError& failure) {
        error = FromUtf8(failure.what());
        return false;
    }
}

std::string JobSession::JobBeside(const std::string& neutralPath) {
    return std::filesystem::path(neutralPath).replace_extension(".job").string();
}

bool JobSession::IsNeutralFile(const std::string& path) {
    std::ifstream file(path, std::ios::binary);
    std::string line;
    if (!file || !std::getline(file, line)) return false;
    if (line.rfind("\xEF\xBB\xBF", 0) == 0) line.erase(0, 3);
    return ToUpper(Trim(FromUtf8(line))) == kNeutralFileHeader;
}

UNeditDoc* JobSession::DocumentOf(const std::string& neutralPath, std::wstring& error,
                                  bool& imported) {
    imported = false;
    const std::wstring name = FromUtf8(std::filesystem::path(neutralPath).stem().string());
    if (UNeditDoc* doc = container_->GetNeditDoc(name)) return doc;
    std::wstring created;
    if (!container_->CreateNEditDocFromNeutralFile(name, FromUtf8(neutralPath), &created)) {
        error = FromUtf8(neutralPath) + L" could not be brought into the job.";
        return nullptr;
    }
    imported = true;
    // The import numbers its names; the file's own name is taken when it is free.
    if (container_->RenameNeditDoc(name, created)) return container_->GetNeditDoc(name);
    return container_->GetNeditDoc(created);
}

}  // namespace nedit
