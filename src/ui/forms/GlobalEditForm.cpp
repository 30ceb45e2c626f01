#include "ui/forms/GlobalEditForm.h"

#include <QCheckBox>
#include <QGridLayout>
#include <QGroupBox>
#include <QLabel>
#include <QVBoxLayout>

#include "ui/forms/UDlgMaker.h"
#include "ui/forms/UEdit.h"

namespace nedit {

GlobalEditForm::GlobalEditForm(NEdit_Global_Edit& dialog, const FormContext& context,
                               QWidget* parent)
    : LogicForm(dialog, QStringLiteral("Modified Selected Records"), parent, context),
      dialog_(dialog) {
    dialog_.OnInitDialog();
    UDlgMaker& maker = Maker();
    auto* layout = new QVBoxLayout(this);
    layout->addWidget(new QLabel(
        QStringLiteral("Tick what to change in every selected record, and give its new value."),
        this));
    const auto add_group = [&](const QString& title, const QString& rows) {
        auto* box = new QGroupBox(title, this);
        auto* grid = new QGridLayout(box);
        grid->addWidget(new QLabel(rows, box), 0, 0, 1, 2);
        grid->setColumnStretch(1, 1);
        layout->addWidget(box);
        return grid;
    };
    // Made in the order shown, so that Tab goes from each box to its value.
    QGridLayout* station =
        add_group(QStringLiteral("Station Records"), QStringLiteral("<i>STN</i>"));
    QGridLayout* target = add_group(QStringLiteral("Target Records"),
                                    QStringLiteral("<i>BS, SS, SS2; the code also PSX, PSN</i>"));
    const auto add_change = [&](QGridLayout* grid, int line, int id, const QString& text, int& flag,
                                UEdit* value) {
        QCheckBox* check = maker.Check("CHECK,0", text, flag);
        // The value follows its box into the tab order.
        QWidget::setTabOrder(check, value);
        grid->addWidget(check, line, 0);
        grid->addWidget(value, line, 1);
        value->setMinimumWidth(value->fontMetrics().horizontalAdvance(QLatin1Char('0')) * 16);
        boxes_[id] = check;
        values_[id] = value;
    };
    add_change(station, 1, NEdit_Global_Edit::kStnCodeBox, QStringLiteral("Modified Code"),
               dialog_.ModifyStnCode, maker.Edit("POINTCODE", dialog_.StnCode));
    add_change(station, 2, NEdit_Global_Edit::kInstHeightBox,
               QStringLiteral("Modified Instr. Height"), dialog_.ModifyInstHeight,
               maker.Edit("LENGTH", dialog_.InstHeight));
    add_change(target, 1, NEdit_Global_Edit::kTargetCodeBox, QStringLiteral("Modified Target Code"),
               dialog_.ModifyTargetCode, maker.Edit("POINTCODE", dialog_.TargetCode));
    add_change(target, 2, NEdit_Global_Edit::kTargetHeightBox,
               QStringLiteral("Modified Target Height"), dialog_.ModifyTargetHeight,
               maker.Edit("LENGTH", dialog_.TargetHeight));
    AddButtons(layout);
    connect(&maker, &UDlgMaker::changed, this, &GlobalEditForm::UpdateEnabling);
    UpdateEnabling();
}

void GlobalEditForm::UpdateEnabling() {
    for (const auto& [id, check] : boxes_) {
        check->setEnabled(dialog_.IsBoxEnabled(id));
        values_.at(id)->setEnabled(dialog_.IsValueEnabled(id));
    }
}

}  // namespace nedit
