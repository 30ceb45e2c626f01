#include "ui/forms/UploadSelectionForm.h"

#include <QAbstractButton>
#include <QButtonGroup>
#include <QCheckBox>
#include <QComboBox>
#include <QGridLayout>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QVBoxLayout>
#include <tuple>

#include "ui/forms/UDlgMaker.h"
#include "ui/forms/UEdit.h"

namespace nedit {

namespace {

constexpr int kByPtRange = 1122;
constexpr int kByLayer = 1123;
constexpr int kByCode = 1124;
constexpr int kByHeight = 1025;
constexpr int kByWindow = 1120;
constexpr int kByScreen = 1121;

}  // namespace

UploadSelectionForm::UploadSelectionForm(UUploadSource& dialog, const FormContext& context,
                                         QWidget* parent)
    : LogicForm(dialog, QStringLiteral("Selection Screen Entry"), parent, context),
      dialog_(dialog) {
    dialog_.OnInitDialog();
    UDlgMaker& maker = Maker();
    auto* layout = new QVBoxLayout(this);
    auto* top = new QHBoxLayout();
    source_ = maker.Radio("RADIO,1,", dialog_.Source,
                          {{UUploadSource::kDatabase, QStringLiteral("Database")},
                           {UUploadSource::kFile, QStringLiteral("File")}});
    top->addWidget(UDlgMaker::RadioBox(QStringLiteral("Upload From"), source_, this));
    layers_ =
        maker.Radio("RADIO,1,", dialog_.AllLayer,
                    {{UUploadSource::kAllLayers, QStringLiteral("All Layers")},
                     {UUploadSource::kLayersOn, QStringLiteral("All Layers Currently On")},
                     {UUploadSource::kLayersOff, QStringLiteral("All Layers Currently Off")}});
    top->addWidget(UDlgMaker::RadioBox(QStringLiteral("Upload Layers Criteria"), layers_, this));
    layout->addLayout(top);

    auto* points = new QGroupBox(QStringLiteral("Points Upload Selection"), this);
    auto* grid = new QGridLayout(points);
    grid->addWidget(new QLabel(QStringLiteral("From"), points), 0, 1);
    grid->addWidget(new QLabel(QStringLiteral("To"), points), 0, 2);
    int line = 1;
    const auto add_range = [&](int id, const QString& text, int& flag, QWidget* from, QWidget* to) {
        QCheckBox* check = maker.Check("CHECK,0,", text, flag);
        // Each range follows its box in the tab order.
        QWidget::setTabOrder(check, from);
        QWidget::setTabOrder(from, to);
        grid->addWidget(check, line, 0);
        grid->addWidget(from, line, 1);
        grid->addWidget(to, line, 2);
        boxes_[id] = check;
        ranges_[id] = {from, to};
        ++line;
    };
    const auto layer_list = [&](int id, std::wstring& value) {
        return maker.List("TEXT", value, dialog_.GetLayerItems(id), true);
    };
    add_range(kByPtRange, QStringLiteral("By Point Range"), dialog_.ByPtRange,
              maker.Edit("TEXT", dialog_.PointFrom), maker.Edit("TEXT", dialog_.PointTo));
    add_range(kByLayer, QStringLiteral("By Layer Range"), dialog_.ByLayer,
              layer_list(UUploadSource::kLayerFromList, dialog_.LayerFrom),
              layer_list(UUploadSource::kLayerToList, dialog_.LayerTo));
    add_range(kByCode, QStringLiteral("By Code Range"), dialog_.ByCode,
              maker.List("TEXT", dialog_.CodeFrom, {}, true),
              maker.List("TEXT", dialog_.CodeTo, {}, true));
    add_range(kByHeight, QStringLiteral("By Height Range"), dialog_.ByHeight,
              maker.Edit("LENGTH", dialog_.HeightFrom), maker.Edit("LENGTH", dialog_.HeightTo));
    for (const auto& [id, text, flag] :
         {std::tuple{kByWindow, QStringLiteral("By Window"), &dialog_.ByWindow},
          std::tuple{kByScreen, QStringLiteral("On Screen"), &dialog_.ByScreen}}) {
        QCheckBox* check = maker.Check("CHECK,0,", text, *flag);
        grid->addWidget(check, line++, 0);
        boxes_[id] = check;
    }
    grid->setColumnStretch(1, 1);
    grid->setColumnStretch(2, 1);
    layout->addWidget(points);
    AddButtons(layout);
    connect(&maker, &UDlgMaker::changed, this, &UploadSelectionForm::UpdateEnabling);
    UpdateEnabling();
}

void UploadSelectionForm::UpdateEnabling() {
    for (const auto& [id, range] : ranges_) {
        const bool on = boxes_.at(id)->isChecked();
        range.first->setEnabled(on);
        range.second->setEnabled(on);
    }
}

}  // namespace nedit
