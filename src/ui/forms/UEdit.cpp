#include "ui/forms/UEdit.h"

#include <QPainter>
#include <QRegularExpression>
#include <QStyle>
#include <QStyleOptionFrame>
#include <algorithm>
#include <cmath>

#include "platform/format/UFormatAngle.h"
#include "platform/geometry/UWPoint.h"
#include "platform/job/UJobSettings.h"
#include "platform/text/NumberText.h"

namespace nedit {

namespace {

constexpr int kUnitGap = 4;

const QRegularExpression& WholeNumber() {
    static const QRegularExpression pattern(QStringLiteral("^[+-]?[0-9]+$"));
    return pattern;
}

const QRegularExpression& RealNumber() {
    static const QRegularExpression pattern(
        QStringLiteral("^[+-]?([0-9]+\\.?[0-9]*|\\.[0-9]+)([eE][+-]?[0-9]+)?$"));
    return pattern;
}

/// The minutes and seconds of a ddd.mmss text are each below 60.
bool IsSexagesimal(const QString& text) {
    const qsizetype point = text.indexOf(QLatin1Char('.'));
    if (point < 0) return true;
    const QString fraction = text.mid(point + 1).leftJustified(4, QLatin1Char('0'));
    return fraction.left(2).toInt() < 60 && fraction.mid(2, 2).toInt() < 60;
}

}  // namespace

UEdit::UEdit(Kind kind, const UJobSettings* job, QWidget* parent)
    : QLineEdit(parent),
      kind_(kind),
      job_(job),
      angle_unit_(job != nullptr ? job->GetAngleUnit() : AngleUnit::DegMinSec) {
    if (IsNumber()) setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    SetAngleUnit(angle_unit_);
    connect(this, &QLineEdit::textChanged, this, &UEdit::Check);
}

void UEdit::SetAngleUnit(AngleUnit unit) {
    angle_unit_ = unit;
    const QString unit_text = Unit();
    const int width =
        unit_text.isEmpty() ? 0 : fontMetrics().horizontalAdvance(unit_text) + 2 * kUnitGap;
    setTextMargins(0, 0, width, 0);
    update();
}

QString UEdit::Unit() const {
    if (IsAngle()) {
        switch (angle_unit_) {
            case AngleUnit::Degrees:
                return QStringLiteral("deg");
            case AngleUnit::Gons:
                return QStringLiteral("gon");
            default:
                return QStringLiteral("dms");
        }
    }
    if (IsLength()) {
        switch (job_ != nullptr ? job_->GetLengthUnit() : LengthUnit::Metres) {
            case LengthUnit::Feet:
                return QStringLiteral("ft");
            case LengthUnit::USFeet:
                return QStringLiteral("usft");
            default:
                return QStringLiteral("m");
        }
    }
    return {};
}

void UEdit::SetValue(double value) {
    if (kind_ == Kind::Long) {
        setText(QString::number(std::lround(value)));
    } else if (IsAngle()) {
        if (kind_ == Kind::Bearing) value = std::fmod(std::fmod(value, 360.0) + 360.0, 360.0);
        const int decimals =
            std::max(job_ != nullptr ? job_->GetAngleDecimals() : 4, minimum_decimals_);
        const UFormatAngle format(IndexOf(angle_unit_), decimals, 0);
        setText(QString::fromStdWString(format.ConvertToDisplayString(DoubleToText(value))));
    } else if (kind_ == Kind::Elevation && value <= UWPoint::kNoHeight) {
        clear();
    } else if (IsLength()) {
        const int decimals =
            std::max(job_ != nullptr ? job_->GetLengthDecimals() : 3, minimum_decimals_);
        setText(QString::number(value, 'f', decimals));
    } else {
        setText(QString::fromStdWString(DoubleToText(value)));
    }
}

double UEdit::Value() const {
    if (IsBlank()) return kind_ == Kind::Elevation ? UWPoint::kNoHeight : 0.0;
    const double number = TextToDouble(text().toStdWString());
    return IsAngle() ? ToDegrees(number, angle_unit_) : number;
}

bool UEdit::IsBlank() const {
    return text().trimmed().isEmpty();
}

QString UEdit::Problem() const {
    const QString typed = text().trimmed();
    if ((kind_ == Kind::PointName || kind_ == Kind::PointCode) &&
        (typed.contains(QLatin1Char(',')) || typed.contains(QLatin1Char('=')))) {
        return tr("\"%1\" cannot stand in a record: a name or a code holds no comma and no "
                  "'='.")
            .arg(typed);
    }
    if (!IsNumber() || IsBlank()) return {};
    if (kind_ == Kind::Long) {
        return WholeNumber().match(typed).hasMatch()
                   ? QString()
                   : tr("\"%1\" is not a whole number.").arg(typed);
    }
    if (!RealNumber().match(typed).hasMatch()) return tr("\"%1\" is not a number.").arg(typed);
    if (IsAngle() && angle_unit_ == AngleUnit::DegMinSec && !IsSexagesimal(typed)) {
        return tr("\"%1\" is not an angle in ddd.mmss: minutes and seconds run from 00 to 59.")
            .arg(typed);
    }
    return {};
}

void UEdit::Check() {
    QPalette colours = palette();
    colours.setColor(QPalette::Text,
                     Problem().isEmpty() ? QPalette().color(QPalette::Text) : QColor(Qt::red));
    setPalette(colours);
    setToolTip(Problem());
}

void UEdit::paintEvent(QPaintEvent* event) {
    QLineEdit::paintEvent(event);
    const QString unit = Unit();
    if (unit.isEmpty()) return;
    QStyleOptionFrame option;
    initStyleOption(&option);
    const QRect area = style()->subElementRect(QStyle::SE_LineEditContents, &option, this);
    QPainter painter(this);
    painter.setPen(palette().color(QPalette::Disabled, QPalette::Text));
    painter.drawText(area.adjusted(0, 0, -kUnitGap, 0), Qt::AlignRight | Qt::AlignVCenter, unit);
}

}  // namespace nedit
