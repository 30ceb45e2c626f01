#include "ui/QtDialogHost.h"

#include <QMessageBox>
#include <QPushButton>

#include "transfer/LockedLayersQuestion.h"
#include "ui/dialogs/ObjectInfoDialogs.h"
#include "ui/dialogs/UDisplaySettingsDlg.h"
#include "ui/dialogs/UGetNameDlg.h"
#include "ui/forms/BackBearingForm.h"
#include "ui/forms/CoordEntryForm.h"
#include "ui/forms/DisplaySettingsForm.h"
#include "ui/forms/DownloadForm.h"
#include "ui/forms/EditRecordForm.h"
#include "ui/forms/FileDialogForm.h"
#include "ui/forms/GenericForm.h"
#include "ui/forms/GetNameForm.h"
#include "ui/forms/GlobalEditForm.h"
#include "ui/forms/LoadRawForm.h"
#include "ui/forms/ObjectInfoForm.h"
#include "ui/forms/PortSettingsForm.h"
#include "ui/forms/ReportParametersForm.h"
#include "ui/forms/UploadSelectionForm.h"

namespace nedit {

namespace {

struct ButtonAnswer {
    QMessageBox::StandardButton button;
    int answer;
};

std::vector<ButtonAnswer> ButtonsOf(unsigned flags) {
    switch (flags & mb::ButtonsMask) {
        case mb::OkCancel:
            return {{QMessageBox::Ok, mb::IdOk}, {QMessageBox::Cancel, mb::IdCancel}};
        case mb::AbortRetryIgnore:
            return {{QMessageBox::Abort, mb::IdAbort},
                    {QMessageBox::Retry, mb::IdRetry},
                    {QMessageBox::Ignore, mb::IdIgnore}};
        case mb::YesNoCancel:
            return {{QMessageBox::Yes, mb::IdYes},
                    {QMessageBox::No, mb::IdNo},
                    {QMessageBox::Cancel, mb::IdCancel}};
        case mb::YesNo:
            return {{QMessageBox::Yes, mb::IdYes}, {QMessageBox::No, mb::IdNo}};
        case mb::RetryCancel:
            return {{QMessageBox::Retry, mb::IdRetry}, {QMessageBox::Cancel, mb::IdCancel}};
        default:
            return {{QMessageBox::Ok, mb::IdOk}};
    }
}

QMessageBox::Icon IconOf(unsigned flags) {
    switch (flags & mb::IconMask) {
        case mb::IconStop:
            return QMessageBox::Critical;
        case mb::IconQuestion:
            return QMessageBox::Question;
        case mb::IconExclamation:
            return QMessageBox::Warning;
        case mb::IconInformation:
            return QMessageBox::Information;
        default:
            return QMessageBox::NoIcon;
    }
}

}  // namespace

QtDialogHost::QtDialogHost(QWidget* parent) : parent_(parent) {
    SetForm<CoordEntryForm, UCoordEntryDlg>();
    SetForm<BackBearingForm, UBKBCoordDlg>();
    SetForm<ReportParametersForm, UOutputParamDlg>();
    SetForm<DisplaySettingsForm, UDisplaySettingsDlg>();
    // A point, a line and an arc are shown in one form, each with what is known of it.
    SetForm<ObjectInfoForm, POINTDLG>();
    SetForm<ObjectInfoForm, LINEDLG>();
    SetForm<ObjectInfoForm, ARCDLG>();
    SetForm<GetNameForm, UGetNameDlg>();
    SetForm<EditRecordForm, UEditRecordDlg>();
    SetForm<GlobalEditForm, NEdit_Global_Edit>();
    SetForm<DownloadForm, UNEDownload>();
    SetForm<PortSettingsForm, USetComm>();
    SetForm<UploadSelectionForm, UUploadSource>();
    // The raw file dialog ends with the button that ended it.
    SetFace<ULoadRawDlg>([this](ULoadRawDlg& dialog) {
        return ShowForm<LoadRawForm>(dialog) == mb::IdOk ? dialog.GetEndCode() : mb::IdCancel;
    });
    SetFace<UFileDialog>([this](UFileDialog& dialog) {
        FileDialogForm form(dialog, parent_);
        if (unattended_) {
            dialog.OnCancel();
            return mb::IdCancel;
        }
        return ExecForm(form) == QDialog::Accepted ? mb::IdOk : mb::IdCancel;
    });
    // The locked layers before a transfer are a question with OK and Cancel.
    SetFace<LockedLayersQuestion>([this](LockedLayersQuestion& question) {
        const int answer = ShowMessage(question.GetMessage(), mb::OkCancel | mb::IconQuestion, 0);
        return answer == mb::IdOk ? mb::IdOk : mb::IdCancel;
    });
}

QtDialogHost::~QtDialogHost() = default;

int QtDialogHost::ShowMessage(const std::wstring& text, unsigned flags, unsigned /*help*/) {
    if (unattended_) return mb::DefaultAnswer(flags);
    QMessageBox box(IconOf(flags), QString::fromLatin1(kTitle), QString::fromStdWString(text),
                    QMessageBox::NoButton, parent_);
    const std::vector<ButtonAnswer> buttons = ButtonsOf(flags);
    for (const ButtonAnswer& button : buttons) box.addButton(button.button);
    const int default_answer = mb::DefaultAnswer(flags);
    for (const ButtonAnswer& button : buttons) {
        if (button.answer == default_answer) box.setDefaultButton(button.button);
    }
    const int pressed = ExecMessage(box);
    for (const ButtonAnswer& button : buttons) {
        if (button.button == pressed) return button.answer;
    }
    // Closing the box without a button answers as Escape does: the last button.
    return buttons.back().answer;
}

int QtDialogHost::Show(UDialogLogic& dialog, const Face* face) {
    return face != nullptr ? (*face)(dialog) : ShowForm<GenericForm>(dialog);
}

int QtDialogHost::Exec(QDialog& form) {
    if (unattended_) {
        form.accept();
        return form.result() == QDialog::Accepted ? mb::IdOk : mb::IdCancel;
    }
    return ExecForm(form) == QDialog::Accepted ? mb::IdOk : mb::IdCancel;
}

int QtDialogHost::ExecForm(QDialog& form) {
    return form.exec();
}

int QtDialogHost::ExecMessage(QMessageBox& box) {
    box.exec();
    return box.standardButton(box.clickedButton());
}

}  // namespace nedit
