#include "ui/forms/NumberField.h"

#include <QRegularExpressionValidator>

#include "platform/text/NumberText.h"

namespace nedit {

NumberField::NumberField(QWidget* parent) : QLineEdit(parent) {
    setValidator(new QRegularExpressionValidator(
        QRegularExpression(QStringLiteral("-?[0-9]*\\.?[0-9]*")), this));
    setAlignment(Qt::AlignRight);
}

void NumberField::SetValue(double value, int decimals) {
    setText(QString::number(value, 'f', decimals));
}

double NumberField::Value(double fallback) const {
    return IsBlank() ? fallback : TextToDouble(text().toStdWString());
}

bool NumberField::IsBlank() const {
    return text().trimmed().isEmpty();
}

}  // namespace nedit
