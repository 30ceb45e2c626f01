#pragma once
// The name of a raw-data document: chosen from the job's documents to open one, or typed
// to save one under. Names are the names of the document's storage in the job.

#include <string>
#include <vector>

#include "platform/messages/DialogHost.h"

namespace nedit {

class UGetNameDlg : public UDialogLogic {
  public:
    enum class Mode { Open, Save };

    /// `names` are the documents of the job; `name` the default.
    UGetNameDlg(Mode mode, std::vector<std::wstring> names, std::wstring name = L"");

    std::wstring DialogName() const override;
    /// Refuses, keeping the dialog open, a name that is blank, in Open mode one that is not
    /// among the documents, and in Save mode one longer than kMaxName or holding '/' or '\'.
    bool OnOK() override;

    static constexpr std::size_t kMaxName = 64;

    Mode GetMode() const { return Which; }
    const std::vector<std::wstring>& GetNames() const { return Names; }
    /// The name as typed or chosen; trimmed by OnOK.
    std::wstring Name;

  private:
    Mode Which;
    std::vector<std::wstring> Names;
};

}  // namespace nedit
