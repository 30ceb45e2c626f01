#pragma once
// The plan beside the record list: the reduced points with their names and codes, lines,
// arcs, circles and station lines, in world coordinates. The wheel zooms about the mouse,
// the middle button (or the left in Pan) drags the plan, Zoom Window drags a rectangle;
// Zoom All, Zoom Previous and Zoom Next walk the zoom history. A left click picks a point,
// line or arc, which selects its record in the list; a double click shows what is known of
// the picked object. A record selected in the list flies the plan to its point.
//
// Decisions:
// - The plan is drawn once into a buffer at the screen's full density and shown from it;
//   the selection and the flash of a point are drawn over the buffer, so they cost nothing.
// - While a reduction runs the stores are being rebuilt: the plan shows its last picture
//   and reads nothing of the engine until DatabaseReplaced.
// - The flash of a point (a ring of 12, then of 8 pixels, 100 ms each) is timed, not
//   waited for, so that stepping through the list with the keys stays quick.
// - The scale of "Zoom a Point" counts the job's length unit in metres of the screen: a
//   1:500 plan in feet shows 500 feet on one foot of screen.
// - The highlight colour is amber on the dark plan: the desktop's own highlight colour is
//   made for light backgrounds.

#include <QPixmap>
#include <QPoint>
#include <QWidget>

#include "document/ListInterfaces.h"
#include "ui/PlanScene.h"
#include "ui/PlanStyle.h"
#include "ui/PlanTransform.h"

class QTimer;
class UNeditDoc;

namespace nedit {

class ZoomPointBar;

class UNeditGraphView : public QWidget, public UGraphicPointView {
    Q_OBJECT
  public:
    enum class Mode { Select, Pan, ZoomWindow };

    explicit UNeditGraphView(QWidget* parent = nullptr);
    ~UNeditGraphView() override;

    void SetDoc(UNeditDoc* doc);
    UNeditDoc* GetDoc() const { return doc_; }

    /// A reduction is about to replace the stores: the selection goes and the plan keeps
    /// its picture without reading the engine.
    void BeginReplace();
    /// The stores have been replaced (or are gone): the plan reads them afresh.
    void DatabaseReplaced();
    /// The display settings or the job's settings changed.
    void UpdateStyle();

    /// Draws everything again; `clear` also forgets the buffered picture.
    void Redraw(bool clear);
    /// The extents of the run's points; (0, 0, 100, 100) without any.
    UWRect GetDocExtents() const;
    /// Zoom All.
    void ResetExtents();
    void ResetSelectedLine();
    bool SetSelectedPoint(const std::wstring& name) override;
    void ViewSelectedPoint() override;
    /// Opens the bar of "Zoom a Point".
    void ZoomPoint();
    /// Zooms to the point of that number at 1:`scale`; false when there is no such point.
    bool ZoomToPoint(const std::wstring& name, double scale);

    bool GetMouseClickFlag() const { return mouse_click_flag_; }
    void SetMouseClickFlag(bool flag) { mouse_click_flag_ = flag; }

    /// Carries out a zoom command (Zoom All, In, Out, Window, Previous, Next, Pan, Zoom a
    /// Point, Zoom Selected, Redraw); false for any other command.
    bool RunCommand(int id);
    bool CanZoomPrevious() const { return transform_.CanZoomPrevious(); }
    bool CanZoomNext() const { return transform_.CanZoomNext(); }

    /// A left click at a point of the widget, as the mouse gives it.
    void PickAt(const QPoint& at);
    /// The pick aperture in pixels, by the job's pick setting.
    int Aperture() const;
    /// The S of the present scale 1:S.
    double CurrentScale() const;

    const PlanTransform& Transform() const { return transform_; }
    PlanTransform& Transform() { return transform_; }
    const PlanScene& Scene() const { return scene_; }
    const PlanPick& Selected() const { return selected_; }
    Mode GetMode() const { return mode_; }
    ZoomPointBar* Bar() const { return bar_; }
    /// The plan as it is drawn now, selection and all.
    QImage Render() const;

  signals:
    /// The user picked an object; its record should be selected.
    void objectPicked(const nedit::PlanPick& pick);
    /// A double click on the picked object.
    void objectInfoRequested(const nedit::PlanPick& pick);
    void cursorMoved(double east, double north);
    void cursorLeft();
    void scaleChanged(double scale);
    void zoomHistoryChanged();

  protected:
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void leaveEvent(QEvent* event) override;

  private:
    void PaintPlan(QPainter& painter) const;
    void PaintOverlay(QPainter& painter) const;
    void ViewChanged();
    void ZoomBy(double factor);
    void ZoomToWindow(const QRect& window);
    void SetMode(Mode mode);
    double PixelsPerUnit() const;
    UWPoint World(const QPointF& at) const;

    UNeditDoc* doc_ = nullptr;
    PlanScene scene_;
    PlanTransform transform_;
    PlanStyle style_;
    PlanPick selected_;
    bool frozen_ = false;
    bool zoomed_once_ = false;
    bool mouse_click_flag_ = true;
    Mode mode_ = Mode::Select;
    mutable QPixmap buffer_;
    mutable bool buffer_valid_ = false;
    // Dragging: the middle button or Pan moves the plan, Zoom Window draws a rectangle.
    enum class Drag { None, Pan, Window };
    Drag drag_ = Drag::None;
    QPoint drag_from_;
    QPoint drag_to_;
    qint64 last_wheel_ms_ = 0;
    int flash_radius_ = 0;
    QTimer* flash_;
    ZoomPointBar* bar_;
};

}  // namespace nedit
