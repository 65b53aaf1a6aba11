#include "Utils/AudioPlayer.h"

#include "SharedSystem/Platform.h"

#include <QDebug>
#include <QMutexLocker>

namespace {

// aplay runs detached through the platform layer, so a running sound is
// stopped by name. Every sound of the instrument is shorter than this; one
// that started longer ago has ended by itself and needs no stopping.
const qint64 kLongestSoundMs = 3000;

AudioPlayerTask* g_task = nullptr;

} // namespace

AudioPlayerTask* AudioPlayerTask::instance()
{
    if (!g_task)
        g_task = new AudioPlayerTask;
    return g_task;
}

AudioPlayerTask::AudioPlayerTask()
{
    startAndWait(QThread::InheritPriority);
    qDebug() << "AudioPlayer Thread is Running";
}

AudioPlayer::AudioPlayer(QObject* parent)
    : QObject(parent)
{
    qDebug() << "AudioPlayer Object Created";
}

AudioPlayer* AudioPlayer::instance()
{
    if (!AudioPlayerTask::worker())
        AudioPlayerTask::instance();
    return AudioPlayerTask::worker();
}

void AudioPlayer::Init()
{
}

QString AudioPlayer::soundFile(SOUNDS sound)
{
    switch (sound) {
    case eSoundButtonClick: return "/opt/GUI/Sounds/click.wav";
    case eSoundMeasurementStarted: return "/opt/GUI/Sounds/start_measurement.wav";
    case eSoundMeasurementSuccessful: return "/opt/GUI/Sounds/measurement_successful.wav";
    case eSoundMeasurementFailed: return "/opt/GUI/Sounds/measurement_failed.wav";
    case eSoundJobComplete: return "/opt/GUI/Sounds/job_finished.wav";
    case eSoundCalculationFinished: return "/opt/GUI/Sounds/calculation_finished.wav";
    case eSoundErrorUser: return "/opt/GUI/Sounds/errorUser.wav";
    case eSoundErrorApocalypse: return "/opt/GUI/Sounds/errorApocalypse.wav";
    case eSoundDeviceReady: return "/opt/GUI/Sounds/device_ready.wav";
    case eSoundDevicePositioned: return "/opt/GUI/Sounds/device_positioned.wav";
    default: return QString();
    }
}

void AudioPlayer::playSound(SOUNDS sound)
{
    const QString file = soundFile(sound);
    if (file.isEmpty()) {
        stopAllSounds();
        return;
    }
    playSoundFile(file);
}

void AudioPlayer::playSoundFile(const QString& file)
{
    qDebug() << QString("*******Playing sound %1********").arg(file);
    QMutexLocker lock(&m_mutex);
    stopPlaying();
    m_player = Platform::startProcess("aplay", QStringList() << "-N" << Platform::devicePath(file));
    m_playing.start();
}

void AudioPlayer::playSoundErrorApocalypse()
{
    playSound(eSoundErrorApocalypse);
}

void AudioPlayer::stopAllSounds()
{
    QMutexLocker lock(&m_mutex);
    stopPlaying();
}

bool AudioPlayer::isPlaying() const
{
    QMutexLocker lock(&m_mutex);
    return m_playing.isValid() && m_playing.elapsed() < kLongestSoundMs;
}

void AudioPlayer::stopPlaying()
{
    // Only our own player is ended, and only while its sound can still run.
    if (m_player && m_playing.isValid() && m_playing.elapsed() < kLongestSoundMs)
        m_player->stop();
    m_player.reset();
    m_playing.invalidate();
}
