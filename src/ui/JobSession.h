#pragma once
// The job the desktop has open: its survey database and the container of its raw-data
// documents. It opens and makes job files and brings neutral files in as documents.
//
// Decisions:
// - A neutral file opened on its own becomes a document of the job beside it: the same
//   folder and name with ".job". That job is made when it does not exist (with the default
//   survey codes) and reused when it does; the document is named after the file, and when
//   the job holds a document of that name already it is opened instead of importing the
//   file a second time, so the user's edits made there are never covered over.

#include <memory>
#include <string>

class URawDataContainer;
class UNeditDoc;
class USurveyDoc;

namespace nedit {

class JobSession {
  public:
    JobSession();
    ~JobSession();

    /// Opens a job file. False, with the reason in `error`, when it cannot be opened.
    bool Open(const std::string& path, std::wstring& error);
    /// Makes a new job file with the default survey codes and opens it.
    bool Create(const std::string& path, std::wstring& error);
    void Close();
    bool IsOpen() const { return job_ != nullptr; }

    USurveyDoc* Job() const { return job_.get(); }
    URawDataContainer* Container() const { return container_.get(); }
    const std::string& Path() const { return path_; }

    /// The job beside a neutral file: the same folder and name with ".job".
    static std::string JobBeside(const std::string& neutralPath);
    /// True when the file begins with a neutral file's header (a UTF-8 mark and blanks
    /// allowed before it).
    static bool IsNeutralFile(const std::string& path);
    /// The document named after a neutral file (its name without the extension), made from
    /// the file unless the job holds one of that name already. Null, with `error`, when the
    /// file cannot be read or no name is free.
    UNeditDoc* DocumentOf(const std::string& neutralPath, std::wstring& error, bool& imported);

  private:
    bool Adopt(std::unique_ptr<USurveyDoc> job, const std::string& path, std::wstring& error);

    std::unique_ptr<USurveyDoc> job_;
    std::unique_ptr<URawDataContainer> container_;
    std::string path_;
};

}  // namespace nedit
