// The sound player: which file each sound plays, that a new sound cuts the
// running one, and that requests reach it on its own thread.

#include "SharedSystem/Platform.h"
#include "Utils/AudioPlayer.h"

#include <QCoreApplication>
#include <QtTest>

class TestAudioPlayer : public QObject
{
    Q_OBJECT

private:
    static QString aplay(const QString& file)
    {
        return "aplay -N " + Platform::devicePath("/opt/GUI/Sounds/" + file);
    }

private slots:
    void init() { Platform::clearRecordedCommands(); }

    void everySoundHasItsFile()
    {
        const QStringList expected = {
            "click.wav", "start_measurement.wav", "measurement_successful.wav",
            "measurement_failed.wav", "job_finished.wav", "calculation_finished.wav",
            "errorUser.wav", "errorApocalypse.wav", "device_ready.wav", "device_positioned.wav"};
        for (int s = eSoundButtonClick; s <= eSoundDevicePositioned; ++s)
            QCOMPARE(AudioPlayer::soundFile(SOUNDS(s)), "/opt/GUI/Sounds/" + expected.at(s));
        QVERIFY(AudioPlayer::soundFile(eSoundNone).isEmpty());
        QVERIFY(AudioPlayer::soundFile(SOUNDS(42)).isEmpty());
        // The build stages a real file for every sound.
        for (const QString& file : expected)
            QVERIFY2(QFile::exists(Platform::devicePath("/opt/GUI/Sounds/" + file)), qPrintable(file));
    }

    void aSecondSoundCutsTheFirst()
    {
        AudioPlayer player;
        player.playSound(eSoundButtonClick);
        QVERIFY(player.isPlaying());
        player.playSound(eSoundErrorUser);
        QCOMPARE(Platform::recordedCommands(),
                 QStringList({aplay("click.wav"), "stop " + aplay("click.wav"), aplay("errorUser.wav")}));
    }

    void stoppingStopsOnlyWhatPlays()
    {
        AudioPlayer player;
        player.stopAllSounds();
        QVERIFY(Platform::recordedCommands().isEmpty()); // nothing was playing

        player.playSoundErrorApocalypse();
        player.stopAllSounds();
        QVERIFY(!player.isPlaying());
        QCOMPARE(Platform::recordedCommands(),
                 QStringList({aplay("errorApocalypse.wav"), "stop " + aplay("errorApocalypse.wav")}));

        player.playSound(eSoundJobComplete);
        player.playSound(eSoundNone); // "no sound" is a stop
        QCOMPARE(Platform::recordedCommands().last(), "stop " + aplay("job_finished.wav"));
        QVERIFY(!player.isPlaying());
    }

    void requestsTravelToTheAudioThread()
    {
        qRegisterMetaType<SOUNDS>("SOUNDS");
        AudioPlayer* player = AudioPlayer::instance();
        QVERIFY(player);
        QCOMPARE(AudioPlayer::instance(), player);
        QVERIFY(player->thread() != QThread::currentThread());
        QVERIFY(player->thread()->isRunning());

        QMetaObject::invokeMethod(player, "playSound", Qt::QueuedConnection,
                                  Q_ARG(SOUNDS, eSoundDeviceReady));
        QTRY_VERIFY(Platform::recordedCommands().contains(aplay("device_ready.wav")));
    }
};

QTEST_GUILESS_MAIN(TestAudioPlayer)
#include "tst_audioplayer.moc"
