#include "UiTestSupport.h"

#include <QDialog>
#include <QMessageBox>
#include <QPushButton>

namespace nedit::test {

ConfigDirectory::ConfigDirectory() {
    qputenv("SXNEDIT_CONFIG", dir_.path().toUtf8());
}

QString ExampleFile() {
    return QStringLiteral(SXNEDIT_EXAMPLES "/boundary.neu");
}

int ScriptedHost::ExecForm(QDialog& form) {
    forms_.push_back(form.objectName());
    const auto script = scripts_.find(form.objectName());
    if (script != scripts_.end()) return script->second(form);
    form.accept();
    return form.result();
}

int ScriptedHost::ExecMessage(QMessageBox& box) {
    messages_.push_back(box.text());
    if (answers_.empty()) return box.standardButton(box.defaultButton());
    const int answer = answers_.front();
    answers_.pop_front();
    // The system's answer numbers back to the box's own buttons.
    const std::map<int, QMessageBox::StandardButton> buttons = {
        {mb::IdOk, QMessageBox::Ok},        {mb::IdCancel, QMessageBox::Cancel},
        {mb::IdYes, QMessageBox::Yes},      {mb::IdNo, QMessageBox::No},
        {mb::IdAbort, QMessageBox::Abort},  {mb::IdRetry, QMessageBox::Retry},
        {mb::IdIgnore, QMessageBox::Ignore}};
    return buttons.at(answer);
}

}  // namespace nedit::test
