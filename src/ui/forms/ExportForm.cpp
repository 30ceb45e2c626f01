#include "ui/forms/ExportForm.h"

#include <QCheckBox>
#include <QComboBox>
#include <QFileDialog>
#include <QFormLayout>
#include <QHBoxLayout>
#include <QLineEdit>
#include <QListWidget>
#include <QPushButton>
#include <QVBoxLayout>

#include "exports/ExportFormat.h"

namespace nedit {

namespace {

QString Utf8(const std::string& text) {
    return QString::fromUtf8(text.data(), static_cast<int>(text.size()));
}

}  // namespace

ExportForm::ExportForm(UExportDlg& dialog, const FormContext& context, QWidget* parent)
    : LogicForm(dialog, QString::fromStdWString(dialog.DialogName()), parent, context),
      dialog_(dialog),
      format_(new QComboBox(this)),
      file_(new QLineEdit(Utf8(dialog.Output), this)),
      layers_(new QListWidget(this)),
      crs_(new QLineEdit(Utf8(dialog.Crs), this)),
      document_(new QCheckBox(this)) {
    dialog_.OnInitDialog();
    auto* layout = new QVBoxLayout(this);
    auto* fields = new QFormLayout();
    for (const std::string& word : ExportFormatWords()) {
        const ExportFormat format = *ExportFormatNamed(word);
        format_->addItem(Utf8(ExportFormatTitle(format)), static_cast<int>(format));
        if (format == dialog_.Format) format_->setCurrentIndex(format_->count() - 1);
    }
    fields->addRow(QStringLiteral("Format"), format_);
    auto* browse = new QPushButton(QStringLiteral("Browse..."), this);
    auto* file_line = new QHBoxLayout();
    file_line->addWidget(file_, 1);
    file_line->addWidget(browse);
    fields->addRow(QStringLiteral("File"), file_line);
    for (const std::string& name : dialog_.JobLayers()) {
        auto* item = new QListWidgetItem(Utf8(name), layers_);
        const bool ticked =
            std::find(dialog_.Layers.begin(), dialog_.Layers.end(), name) != dialog_.Layers.end();
        item->setCheckState(ticked ? Qt::Checked : Qt::Unchecked);
    }
    fields->addRow(QStringLiteral("Layers (none ticked: all)"), layers_);
    crs_->setPlaceholderText(QStringLiteral("EPSG:NNNN"));
    fields->addRow(QStringLiteral("Coordinate system"), crs_);
    layout->addLayout(fields);
    document_->setText(
        QStringLiteral("Observations of %1 under Survey").arg(Utf8(dialog_.DocumentName())));
    document_->setChecked(dialog_.WithDocument);
    layout->addWidget(document_);
    AddButtons(layout);
    connect(browse, &QPushButton::clicked, this, &ExportForm::Browse);
    connect(format_, &QComboBox::currentIndexChanged, this, &ExportForm::FormatChosen);
    FormatChosen();
}

void ExportForm::FormatChosen() {
    document_->setEnabled(format_->currentData().toInt() ==
                          static_cast<int>(ExportFormat::LandXml));
}

void ExportForm::Browse() {
    const QString path =
        QFileDialog::getSaveFileName(this, QStringLiteral("Export"), file_->text());
    if (!path.isEmpty()) file_->setText(path);
}

void ExportForm::Store() {
    dialog_.Format = static_cast<ExportFormat>(format_->currentData().toInt());
    dialog_.Output = file_->text().trimmed().toStdString();
    dialog_.Crs = crs_->text().trimmed().toUpper().toStdString();
    dialog_.WithDocument = document_->isChecked();
    dialog_.Layers.clear();
    for (int row = 0; row < layers_->count(); ++row) {
        const QListWidgetItem* item = layers_->item(row);
        if (item->checkState() == Qt::Checked) dialog_.Layers.push_back(item->text().toStdString());
    }
}

void ExportForm::Refused() {
    if (Context().host != nullptr)
        Context().host->ShowMessage(QString::fromStdString(dialog_.Refusal()).toStdWString(),
                                    mb::IconStop, 0);
    file_->setFocus();
}

}  // namespace nedit
