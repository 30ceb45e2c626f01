#include <QtTest>
class PlanSceneTest : public QObject {
    Q_OBJECT
  private slots:
    void placeholder() {}
};
QTEST_MAIN(PlanSceneTest)
#include "PlanSceneTest.moc"
