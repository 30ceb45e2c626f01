#include "ui/forms/FileDialogForm.h"

#include <QRegularExpression>

namespace nedit {

FileDialogForm::FileDialogForm(UFileDialog& dialog, QWidget* parent)
    : QFileDialog(parent), dialog_(dialog) {
    const bool save = dialog_.GetMode() == UFileDialog::Mode::Save;
    setObjectName(QString::fromStdWString(dialog_.DialogName()));
    setWindowTitle(QString::fromStdWString(dialog_.DialogName()));
    setAcceptMode(save ? AcceptSave : AcceptOpen);
    setFileMode(save ? AnyFile : ExistingFile);
    setNameFilters(NameFilters(dialog_.Filter));
    if (!dialog_.InitialDir.empty()) setDirectory(QString::fromStdString(dialog_.InitialDir));
    if (!dialog_.DefaultExt.empty()) setDefaultSuffix(QString::fromStdWString(dialog_.DefaultExt));
    setOption(DontConfirmOverwrite, !dialog_.OverwritePrompt);
    dialog_.OnInitDialog();
}

void FileDialogForm::accept() {
    QFileDialog::accept();
    if (result() != Accepted) return;
    const QStringList chosen = selectedFiles();
    dialog_.PathName = chosen.isEmpty() ? std::string() : chosen.front().toStdString();
    if (!dialog_.OnOK()) setResult(Rejected);
}

void FileDialogForm::reject() {
    dialog_.OnCancel();
    QFileDialog::reject();
}

QStringList FileDialogForm::NameFilters(const std::wstring& filter) {
    const QStringList parts = QString::fromStdWString(filter).split(QLatin1Char('|'));
    static const QRegularExpression patterns_in_name(QStringLiteral("\\s*\\([^()]*\\)\\s*$"));
    QStringList filters;
    for (int i = 0; i + 1 < parts.size(); i += 2) {
        if (parts[i].isEmpty()) break;
        QString name = parts[i];
        name.remove(patterns_in_name);
        QStringList patterns = parts[i + 1].split(QLatin1Char(';'), Qt::SkipEmptyParts);
        // "*.*" names every file, also those without a point in their names.
        for (QString& pattern : patterns) {
            if (pattern.trimmed() == QStringLiteral("*.*")) pattern = QStringLiteral("*");
        }
        filters << QStringLiteral("%1 (%2)").arg(name.trimmed(), patterns.join(QLatin1Char(' ')));
    }
    return filters;
}

}  // namespace nedit
