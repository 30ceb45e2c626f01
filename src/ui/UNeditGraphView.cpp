#include "ui/UNeditGraphView.h"

#include <QApplication>
#include <QDateTime>
#include <QMouseEvent>
#include <QPainter>
#include <QTimer>
#include <QWheelEvent>
#include <cmath>

#include "document/UNeditDoc.h"
#include "platform/job/USurveyDoc.h"
#include "platform/units/Units.h"
#include "reduction/UNeditDatabase.h"
#include "ui/CommandIds.h"
#include "ui/PlanPainter.h"
#include "ui/ZoomPointBar.h"

namespace nedit {

namespace {

constexpr double kWheelStep = 1.2;
constexpr qint64 kWheelGestureMs = 600;
constexpr int kFlashFirst = 12;
constexpr int kFlashSecond = 8;
constexpr int kFlashMs = 100;
constexpr int kMinZoomWindow = 4;

}  // namespace

UNeditGraphView::UNeditGraphView(QWidget* parent)
    : QWidget(parent), flash_(new QTimer(this)), bar_(new ZoomPointBar(this)) {
    setObjectName(QStringLiteral("Plan"));
    setMouseTracking(true);
    setFocusPolicy(Qt::StrongFocus);
    setAttribute(Qt::WA_OpaquePaintEvent);
    setMinimumSize(120, 120);
    flash_->setSingleShot(true);
    flash_->setInterval(kFlashMs);
    connect(flash_, &QTimer::timeout, this, [this] {
        flash_radius_ = flash_radius_ == kFlashFirst ? kFlashSecond : 0;
        if (flash_radius_ > 0) flash_->start();
        update();
    });
    connect(bar_, &ZoomPointBar::zoomRequested, this, [this](const QString& number, double scale) {
        const bool found = ZoomToPoint(number.toStdWString(), scale);
        if (!found || !bar_->IsLocked()) bar_->hide();
    });
    connect(bar_, &ZoomPointBar::closed, this, [this] { setFocus(); });
    scene_.Build(nullptr);
    transform_.ZoomTo(scene_.Extents());
}

UNeditGraphView::~UNeditGraphView() = default;

void UNeditGraphView::SetDoc(UNeditDoc* doc) {
    doc_ = doc;
    UpdateStyle();
    DatabaseReplaced();
}

void UNeditGraphView::UpdateStyle() {
    if (doc_ != nullptr) style_ = PlanStyle::From(doc_->GetNeditSettings(), doc_->GetSettings());
    Redraw(true);
}

void UNeditGraphView::BeginReplace() {
    ResetSelectedLine();
    frozen_ = true;
    scene_.Build(nullptr);
}

void UNeditGraphView::DatabaseReplaced() {
    frozen_ = false;
    selected_ = {};
    scene_.Build(doc_ != nullptr ? doc_->GetDatabase() : nullptr);
    if (!zoomed_once_) {
        // The first plan of a document shows all of it.
        transform_.ZoomTo(scene_.Extents());
        zoomed_once_ = scene_.Database() != nullptr;
    }
    Redraw(true);
}

void UNeditGraphView::Redraw(bool clear) {
    if (clear) buffer_valid_ = false;
    update();
}

UWRect UNeditGraphView::GetDocExtents() const {
    return scene_.Extents();
}

void UNeditGraphView::ResetExtents() {
    transform_.ZoomTo(GetDocExtents());
    ViewChanged();
}

void UNeditGraphView::ResetSelectedLine() {
    selected_ = {};
    update();
}

bool UNeditGraphView::SetSelectedPoint(const std::wstring& name) {
    UNeditDatabase* database = doc_ != nullptr && !frozen_ ? doc_->GetDatabase() : nullptr;
    const UNeditPt* point = database != nullptr ? database->SearchPt(name) : nullptr;
    if (point == nullptr) return false;
    selected_ = {PlanPick::Kind::Point, static_cast<int>(point - database->GetPointList().data())};
    update();
    return true;
}

void UNeditGraphView::ViewSelectedPoint() {
    if (selected_.kind != PlanPick::Kind::Point || scene_.Database() == nullptr) return;
    const UNeditPt& point =
        scene_.Database()->GetPointList()[static_cast<std::size_t>(selected_.index)];
    if (!transform_.VisibleWorld().Contains(point)) {
        transform_.AddZoomHistory();
        transform_.CentreOn(point);
        ViewChanged();
    }
    flash_radius_ = kFlashFirst;
    flash_->start();
    update();
}

double UNeditGraphView::PixelsPerUnit() const {
    // Pixels of the screen in a metre, as this widget counts pixels.
    const double per_metre = physicalDpiX() / devicePixelRatioF() / 0.0254;
    const double metres_per_unit =
        doc_ != nullptr ? MetresPer(doc_->GetSettings().GetLengthUnit()) : 1.0;
    return per_metre * metres_per_unit;
}

double UNeditGraphView::CurrentScale() const {
    return PixelsPerUnit() / transform_.Scale();
}

void UNeditGraphView::ZoomPoint() {
    if (doc_ == nullptr || doc_->GetSurveyDoc() == nullptr) return;
    UNeditDatabase* database = frozen_ ? nullptr : doc_->GetDatabase();
    std::wstring name;
    if (selected_.kind == PlanPick::Kind::Point && database != nullptr) {
        name = database->GetPointList()[static_cast<std::size_t>(selected_.index)].GetID();
    } else if (const UNeditPt* last = database != nullptr ? database->GetLastPoint() : nullptr) {
        name = last->GetID();
    } else {
        name = doc_->GetSurveyDoc()->GetNextPointNumber();
    }
    bar_->setGeometry(0, 0, width(), bar_->sizeHint().height());
    bar_->Start(QString::fromStdWString(name), std::round(CurrentScale()));
}

bool UNeditGraphView::ZoomToPoint(const std::wstring& name, double scale) {
    if (!SetSelectedPoint(name)) return false;
    const UNeditPt& point =
        scene_.Database()->GetPointList()[static_cast<std::size_t>(selected_.index)];
    if (!std::isfinite(point.x) || !std::isfinite(point.y)) return false;
    emit objectPicked(selected_);
    if (scale > 0.0) {
        transform_.AddZoomHistory();
        transform_.SetWindow(point, PixelsPerUnit() / scale);
        ViewChanged();
    }
    return true;
}

int UNeditGraphView::Aperture() const {
    if (doc_ == nullptr || doc_->GetSurveyDoc() == nullptr) return 16;
    switch (doc_->GetSettings().GetPickAperture()) {
        case 0:
            return 8;
        case 2:
            return 32;
        default:
            return 16;
    }
}

UWPoint UNeditGraphView::World(const QPointF& at) const {
    return transform_.ToWorld({at.x(), at.y()});
}

void UNeditGraphView::PickAt(const QPoint& at) {
    if (!mouse_click_flag_ || frozen_ || (doc_ != nullptr && doc_->GetAbortProcessOn())) return;
    selected_ = scene_.Pick(World(at), transform_.ToWorldLength(Aperture()));
    update();
    if (selected_.kind == PlanPick::Kind::None) return;
    QApplication::beep();
    if (bar_->isVisible() && selected_.kind == PlanPick::Kind::Point) {
        const QString name = QString::fromStdWString(
            scene_.Database()->GetPointList()[static_cast<std::size_t>(selected_.index)].GetID());
        // Picking the same point again locks the number, so that a scale can be set.
        if (name.compare(bar_->Number(), Qt::CaseInsensitive) == 0) bar_->SetLocked(true);
        bar_->SetNumber(name);
    }
    emit objectPicked(selected_);
}

bool UNeditGraphView::RunCommand(int id) {
    switch (id) {
        case cmd::ZoomAll:
            transform_.AddZoomHistory();
            ResetExtents();
            return true;
        case cmd::ZoomIn:
            ZoomBy(2.0);
            return true;
        case cmd::ZoomOut:
            ZoomBy(0.5);
            return true;
        case cmd::ZoomWindow:
            SetMode(mode_ == Mode::ZoomWindow ? Mode::Select : Mode::ZoomWindow);
            return true;
        case cmd::Pan:
            SetMode(mode_ == Mode::Pan ? Mode::Select : Mode::Pan);
            return true;
        case cmd::ZoomPrevious:
            transform_.ZoomPrevious();
            ViewChanged();
            return true;
        case cmd::ZoomNext:
            transform_.ZoomNext();
            ViewChanged();
            return true;
        case cmd::ZoomPoint:
            ZoomPoint();
            return true;
        case cmd::ZoomSelection: {
            const UNeditDatabase* database = scene_.Database();
            if (database == nullptr || selected_.kind == PlanPick::Kind::None) return true;
            const auto index = static_cast<std::size_t>(selected_.index);
            transform_.AddZoomHistory();
            if (selected_.kind == PlanPick::Kind::Point) {
                transform_.CentreOn(database->GetPointList()[index]);
            } else if (selected_.kind == PlanPick::Kind::Line) {
                transform_.CentreOn(database->GetLineList()[index].MidPt());
            } else {
                transform_.CentreOn(database->GetArcList()[index].MidPt());
            }
            ViewChanged();
            return true;
        }
        case cmd::Redraw:
            Redraw(true);
            return true;
        default:
            return false;
    }
}

void UNeditGraphView::ZoomBy(double factor) {
    transform_.AddZoomHistory();
    transform_.ZoomAbout({width() / 2.0, height() / 2.0}, factor);
    ViewChanged();
}

void UNeditGraphView::ZoomToWindow(const QRect& window) {
    if (window.width() < kMinZoomWindow || window.height() < kMinZoomWindow) return;
    const UWPoint a = World(window.topLeft());
    const UWPoint b = World(window.bottomRight());
    transform_.AddZoomHistory();
    transform_.ZoomTo(UWRect(a.x, a.y, b.x, b.y), 0.0);
    ViewChanged();
}

void UNeditGraphView::SetMode(Mode mode) {
    mode_ = mode;
    switch (mode_) {
        case Mode::Pan:
            setCursor(Qt::OpenHandCursor);
            break;
        case Mode::ZoomWindow:
            setCursor(Qt::CrossCursor);
            break;
        default:
            unsetCursor();
            break;
    }
}

void UNeditGraphView::ViewChanged() {
    buffer_valid_ = false;
    update();
    emit scaleChanged(CurrentScale());
    emit zoomHistoryChanged();
}

// ---- Painting ----------------------------------------------------------------------------

void UNeditGraphView::PaintPlan(QPainter& painter) const {
    PlanPainter(scene_, transform_, style_).Paint(painter);
}

void UNeditGraphView::PaintOverlay(QPainter& painter) const {
    if (frozen_) return;
    const PlanPainter plan(scene_, transform_, style_);
    plan.PaintSelection(painter, selected_);
    if (flash_radius_ > 0 && selected_.kind == PlanPick::Kind::Point) {
        const UNeditPt& point =
            scene_.Database()->GetPointList()[static_cast<std::size_t>(selected_.index)];
        const ScreenPoint at = transform_.ToScreen(point);
        painter.setPen(QPen(style_.highlight, 2.0));
        painter.drawEllipse(QPointF(at.x, at.y), flash_radius_, flash_radius_);
    }
}

void UNeditGraphView::paintEvent(QPaintEvent* /*event*/) {
    const qreal density = devicePixelRatioF();
    if (!buffer_valid_ && !frozen_) {
        buffer_ = QPixmap(size() * density);
        buffer_.setDevicePixelRatio(density);
        QPainter buffer_painter(&buffer_);
        PaintPlan(buffer_painter);
        buffer_valid_ = true;
    }
    QPainter painter(this);
    painter.fillRect(rect(), style_.background);
    const bool panning = drag_ == Drag::Pan;
    painter.drawPixmap(panning ? drag_to_ - drag_from_ : QPoint(), buffer_);
    if (panning) return;
    PaintOverlay(painter);
    if (drag_ == Drag::Window) {
        painter.setPen(QPen(style_.highlight, 1.0, Qt::DashLine));
        painter.setBrush(QColor(255, 193, 7, 40));
        painter.drawRect(QRect(drag_from_, drag_to_).normalized());
    }
}

QImage UNeditGraphView::Render() const {
    QImage image(size() * devicePixelRatioF(), QImage::Format_ARGB32_Premultiplied);
    image.setDevicePixelRatio(devicePixelRatioF());
    QPainter painter(&image);
    PaintPlan(painter);
    PaintOverlay(painter);
    return image;
}

void UNeditGraphView::resizeEvent(QResizeEvent* event) {
    const UWPoint centre = transform_.Centre();
    transform_.SetViewSize(width(), height());
    transform_.CentreOn(centre);
    if (!zoomed_once_) transform_.ZoomTo(scene_.Extents());
    bar_->setGeometry(0, 0, width(), bar_->sizeHint().height());
    buffer_valid_ = false;
    QWidget::resizeEvent(event);
}

// ---- Mouse and keys ----------------------------------------------------------------------

void UNeditGraphView::mousePressEvent(QMouseEvent* event) {
    setFocus();
    const QPoint at = event->position().toPoint();
    if (event->button() == Qt::MiddleButton ||
        (event->button() == Qt::LeftButton && mode_ == Mode::Pan)) {
        drag_ = Drag::Pan;
        setCursor(Qt::ClosedHandCursor);
    } else if (event->button() == Qt::LeftButton && mode_ == Mode::ZoomWindow) {
        drag_ = Drag::Window;
    } else {
        if (event->button() == Qt::LeftButton) PickAt(at);
        return;
    }
    drag_from_ = drag_to_ = at;
}

void UNeditGraphView::mouseMoveEvent(QMouseEvent* event) {
    const QPoint at = event->position().toPoint();
    const UWPoint world = World(at);
    emit cursorMoved(world.x, world.y);
    if (drag_ == Drag::None) return;
    drag_to_ = at;
    update();
}

void UNeditGraphView::mouseReleaseEvent(QMouseEvent* /*event*/) {
    const Drag drag = drag_;
    drag_ = Drag::None;
    if (drag == Drag::Window) {
        ZoomToWindow(QRect(drag_from_, drag_to_).normalized());
        SetMode(Mode::Select);
        return;
    }
    if (drag != Drag::Pan) return;
    SetMode(mode_);
    const QPoint moved = drag_to_ - drag_from_;
    if (moved.isNull()) {
        update();
        return;
    }
    transform_.AddZoomHistory();
    transform_.PanBy(moved.x(), moved.y());
    ViewChanged();
}

void UNeditGraphView::mouseDoubleClickEvent(QMouseEvent* event) {
    if (event->button() != Qt::LeftButton || mode_ != Mode::Select || !mouse_click_flag_ ||
        frozen_ || (doc_ != nullptr && doc_->GetAbortProcessOn())) {
        return;
    }
    // The first click of the two has picked; without it the double click picks itself.
    if (selected_.kind == PlanPick::Kind::None) PickAt(event->position().toPoint());
    if (selected_.kind != PlanPick::Kind::None) emit objectInfoRequested(selected_);
}

void UNeditGraphView::wheelEvent(QWheelEvent* event) {
    const double notches = event->angleDelta().y() / 120.0;
    if (notches == 0.0) return;
    const qint64 now = QDateTime::currentMSecsSinceEpoch();
    // One turn of the wheel is one step back in the zoom history, however many notches.
    if (now - last_wheel_ms_ > kWheelGestureMs) transform_.AddZoomHistory();
    last_wheel_ms_ = now;
    const QPointF at = event->position();
    transform_.ZoomAbout({at.x(), at.y()}, std::pow(kWheelStep, notches));
    ViewChanged();
}

void UNeditGraphView::keyPressEvent(QKeyEvent* event) {
    const double step = std::min(width(), height()) / 8.0;
    switch (event->key()) {
        case Qt::Key_Plus:
        case Qt::Key_Equal:
            ZoomBy(2.0);
            break;
        case Qt::Key_Minus:
            ZoomBy(0.5);
            break;
        case Qt::Key_Left:
        case Qt::Key_Right:
        case Qt::Key_Up:
        case Qt::Key_Down: {
            const bool horizontal = event->key() == Qt::Key_Left || event->key() == Qt::Key_Right;
            const double sign =
                event->key() == Qt::Key_Left || event->key() == Qt::Key_Up ? 1.0 : -1.0;
            transform_.PanBy(horizontal ? sign * step : 0.0, horizontal ? 0.0 : sign * step);
            ViewChanged();
            break;
        }
        case Qt::Key_Escape:
            SetMode(Mode::Select);
            bar_->hide();
            break;
        default:
            QWidget::keyPressEvent(event);
            break;
    }
}

void UNeditGraphView::leaveEvent(QEvent* event) {
    emit cursorLeft();
    QWidget::leaveEvent(event);
}

}  // namespace nedit
