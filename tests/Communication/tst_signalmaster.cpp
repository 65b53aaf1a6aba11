// The signal hub: signals with arguments reach a receiver on another thread
// queued, with their values intact, without any registration by the caller.

#include "GUIAPI/API_SignalMaster.h"

#include <QSignalSpy>
#include <QThread>
#include <QtTest>

namespace {

// Lives on another thread and records what reached it.
class Receiver : public QObject
{
    Q_OBJECT
public:
    QStringList snapshot()
    {
        QMutexLocker lock(&m_mutex);
        return m_got;
    }
    QThread* seenOn()
    {
        QMutexLocker lock(&m_mutex);
        return m_seenOn;
    }
public slots:
    void onStatus(const SystemStatus& s) { note(QString("status %1").arg(s.getPercentComplete())); }
    void onTest(const TEST& t, unsigned int r) { note(QString("test %1 %2").arg(t.description).arg(r)); }
    void onPressure(const PRESSURE_SWITCH_T& p) { note(QString("pressure %1").arg(p.Switch2)); }
    void onOrientation(const ACCELEROMETER_ORIENTATION_T& o) { note(QString("orientation %1").arg(o.OrientationY)); }
    void onImage(const QByteArray& b) { note(QString("image %1").arg(b.size())); }
    void onIssue(int i) { note(QString("issue %1").arg(i)); }
    void onJobDelete(unsigned int i) { note(QString("delete %1").arg(i)); }
    void onSample(const Sample& s) { note(QString("sample %1").arg(s.getFileID())); }

private:
    void note(const QString& s)
    {
        QMutexLocker lock(&m_mutex);
        m_seenOn = QThread::currentThread();
        m_got << s;
    }
    QMutex m_mutex;
    QStringList m_got;
    QThread* m_seenOn = nullptr;
};

} // namespace

class TestSignalMaster : public QObject
{
    Q_OBJECT

private slots:
    void isOneLazySingleton()
    {
        QVERIFY(API_SignalMaster::instance() != nullptr);
        QCOMPARE(API_SignalMaster::instance(), API_SignalMaster::instance());
    }

    void argumentsCrossThreadsQueued()
    {
        QThread thread;
        Receiver receiver;
        receiver.moveToThread(&thread);
        thread.start();
        API_SignalMaster* hub = API_SignalMaster::instance();
        connect(hub, &API_SignalMaster::StatusUpdated, &receiver, &Receiver::onStatus);
        connect(hub, &API_SignalMaster::SelfTestTestComplete, &receiver, &Receiver::onTest);
        connect(hub, &API_SignalMaster::TriggerSelfTest, &receiver, [&receiver](const TEST& t) { receiver.onTest(t, 0); });
        connect(hub, &API_SignalMaster::PressureSwitchesUpdated, &receiver, &Receiver::onPressure);
        connect(hub, &API_SignalMaster::OrientationUpdated, &receiver, &Receiver::onOrientation);
        connect(hub, &API_SignalMaster::TargetingImageUpdated, &receiver, &Receiver::onImage);
        connect(hub, &API_SignalMaster::MeasurementIssue, &receiver, &Receiver::onIssue);
        connect(hub, &API_SignalMaster::JobDelete, &receiver, &Receiver::onJobDelete);
        connect(hub, &API_SignalMaster::AddedSample, &receiver, &Receiver::onSample);

        SystemStatus status;
        status.setPercentComplete(64);
        hub->emitStatusUpdated(status);
        TEST test;
        test.description = "White tile";
        hub->emitSelfTestTestComplete(test, 3);
        hub->emitTriggerSelfTest(test);
        PRESSURE_SWITCH_T pressure;
        pressure.Switch2 = 1;
        hub->emitPressureSwitchesUpdated(pressure);
        ACCELEROMETER_ORIENTATION_T orientation;
        orientation.OrientationY = -9;
        hub->emitOrientationUpdated(orientation);
        hub->emitTargetingImageUpdated(QByteArray(503208, 'x'));
        hub->emitMeasurementIssue(-2);
        hub->emitJobDelete(65535);
        Sample sample;
        sample.setFileID(7);
        hub->emitAddedSample(sample);

        const QStringList expected{"status 64", "test White tile 3", "test White tile 0", "pressure 1",
                                   "orientation -9", "image 503208", "issue -2", "delete 65535", "sample 7"};
        QTRY_COMPARE_WITH_TIMEOUT(receiver.snapshot(), expected, 3000);
        QCOMPARE(receiver.seenOn(), &thread);
        thread.quit();
        thread.wait();
        disconnect(hub, nullptr, &receiver, nullptr);
    }
};

QTEST_GUILESS_MAIN(TestSignalMaster)
#include "tst_signalmaster.moc"
