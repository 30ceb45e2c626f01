#include "UiTestSupport.h"

#include <QCheckBox>
#include <QComboBox>
#include <QDialog>
#include <QFile>
#include <QMessageBox>
#include <QPushButton>
#include <QTest>

#include "document/UListCtrl.h"
#include "ui/CNeditViewPane.h"
#include "ui/UNeditGraphView.h"
#include "ui/UNeditView.h"
#include "ui/forms/DownloadForm.h"

namespace nedit::test {

ConfigDirectory::ConfigDirectory() {
    qputenv("SXNEDIT_CONFIG", dir_.path().toUtf8());
}

QString ExampleFile() {
    return QStringLiteral(SXNEDIT_EXAMPLES "/boundary.neu");
}

void ChooseGsiOnCom1(DownloadForm& form) {
    form.List(UNEDownload::kInstrumentList)->setCurrentText(QStringLiteral("Leica GSI"));
    form.List(UNEDownload::kPortList)->setCurrentText(QStringLiteral("COM1"));
    form.SaveRawBox()->setChecked(false);
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

ExampleWindow::ExampleWindow(const std::function<void(ScriptedHost&)>& prepare) {
    QFile::copy(ExampleFile(), Neutral());
    auto host = std::make_unique<ScriptedHost>();
    host_ = host.get();
    if (prepare) prepare(*host_);
    window_ = std::make_unique<UNeditMainWindow>(std::move(host));
    window_->resize(1200, 800);
    window_->show();
    if (!QTest::qWaitForWindowExposed(window_.get())) qWarning("the window did not show");
    window_->OpenPath(Neutral());
    QCoreApplication::processEvents();
}

ExampleWindow::~ExampleWindow() = default;

CNeditViewPane& ExampleWindow::Pane() {
    return *window_->CurrentPane();
}

UListCtrl& ExampleWindow::List() {
    return *Pane().GetListCtrl();
}

UNeditGraphView& ExampleWindow::Plan() {
    return *Pane().GetGraphView();
}

QStringList ExampleWindow::Rows() {
    QStringList rows;
    for (const std::wstring& row : List().GetRows()) rows << QString::fromStdWString(row);
    return rows;
}

QPoint ExampleWindow::OnPlan(double east, double north) {
    const ScreenPoint at = Plan().Transform().ToScreen(east, north);
    return QPoint(static_cast<int>(std::lround(at.x)), static_cast<int>(std::lround(at.y)));
}

QPoint ExampleWindow::OnRow(int row) {
    UNeditView* view = Pane().GetNeditView();
    view->ShowRow(row);
    return view->visualRect(view->model()->index(row, 0)).center();
}

}  // namespace nedit::test
