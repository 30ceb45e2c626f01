#include "ui/QtDialogHost.h"

#include <QMessageBox>
#include <QPushButton>

#include "reduction/UBKBCoordDlg.h"
#include "reduction/UCoordEntryDlg.h"
#include "report/UOutputParamDlg.h"
#include "ui/dialogs/ObjectInfoDialogs.h"
#include "ui/dialogs/UDisplaySettingsDlg.h"
#include "ui/dialogs/UEditRecordDlg.h"
#include "ui/dialogs/UGetNameDlg.h"
#include "ui/forms/BackBearingForm.h"
#include "ui/forms/CoordEntryForm.h"
#include "ui/forms/DisplaySettingsForm.h"
#include "ui/forms/EditRecordForm.h"
#include "ui/forms/GenericForm.h"
#include "ui/forms/GetNameForm.h"
#include "ui/forms/ObjectInfoForm.h"
#include "ui/forms/ReportParametersForm.h"

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

int QtDialogHost::RunDialog(UDialogLogic& dialog) {
    if (auto* coordinates = dynamic_cast<UCoordEntryDlg*>(&dialog)) return Run(*coordinates);
    if (auto* back = dynamic_cast<UBKBCoordDlg*>(&dialog)) return Run(*back);
    if (auto* parameters = dynamic_cast<UOutputParamDlg*>(&dialog)) return Run(*parameters);
    if (auto* display = dynamic_cast<UDisplaySettingsDlg*>(&dialog)) return Run(*display);
    if (auto* info = dynamic_cast<UObjectInfoDlg*>(&dialog)) return Run(*info);
    if (auto* name = dynamic_cast<UGetNameDlg*>(&dialog)) return Run(*name);
    if (auto* record = dynamic_cast<UEditRecordDlg*>(&dialog)) return Run(*record);
    return RunGeneric(dialog);
}

int QtDialogHost::Run(UCoordEntryDlg& dialog) {
    return Show<CoordEntryForm>(dialog);
}

int QtDialogHost::Run(UBKBCoordDlg& dialog) {
    BackBearingForm form(dialog, settings_, parent_);
    return Exec(form);
}

int QtDialogHost::Run(UOutputParamDlg& dialog) {
    return Show<ReportParametersForm>(dialog);
}

int QtDialogHost::Run(UDisplaySettingsDlg& dialog) {
    return Show<DisplaySettingsForm>(dialog);
}

int QtDialogHost::Run(UObjectInfoDlg& dialog) {
    return Show<ObjectInfoForm>(dialog);
}

int QtDialogHost::Run(UGetNameDlg& dialog) {
    return Show<GetNameForm>(dialog);
}

int QtDialogHost::Run(UEditRecordDlg& dialog) {
    return Show<EditRecordForm>(dialog);
}

int QtDialogHost::RunGeneric(UDialogLogic& dialog) {
    return Show<GenericForm>(dialog);
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
