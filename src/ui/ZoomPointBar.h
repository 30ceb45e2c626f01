#pragma once
// The bar of "Zoom a Point" across the top of the plan: a point number and a scale. Enter
// zooms; a point picked in the plan while the bar is open takes its number; "Lock" keeps
// the bar open after a zoom, so that the user can try another scale.

#include <QFrame>

class QCheckBox;
class QLineEdit;

namespace nedit {

class UEdit;

class ZoomPointBar : public QFrame {
    Q_OBJECT
  public:
    explicit ZoomPointBar(QWidget* parent = nullptr);

    /// Opens the bar with a number and a scale (the S of 1:S).
    void Start(const QString& number, double scale);
    void SetNumber(const QString& number);
    QString Number() const;
    double Scale() const;
    bool IsLocked() const;
    void SetLocked(bool locked);

  signals:
    void zoomRequested(const QString& number, double scale);
    void closed();

  protected:
    void keyPressEvent(QKeyEvent* event) override;

  private:
    void Finish();

    QLineEdit* number_;
    UEdit* scale_;
    QCheckBox* lock_;
};

}  // namespace nedit
