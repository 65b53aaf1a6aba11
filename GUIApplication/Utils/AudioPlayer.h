#ifndef AUDIOPLAYER_H
#define AUDIOPLAYER_H

// Plays the instrument's sounds on a thread of its own, so that a touch never
// waits for the speaker. Panels reach it through a queued signal.

#include "SharedSystem/InstrumentTypes.h"
#include "SharedSystem/WorkerTask.h"

#include "SharedSystem/Platform.h"

#include <QElapsedTimer>

#include <memory>
#include <QMutex>
#include <QObject>
#include <QString>

class AudioPlayer : public QObject
{
    Q_OBJECT
public:
    explicit AudioPlayer(QObject* parent = nullptr);

    // The worker of the audio thread; starts the thread on first use.
    static AudioPlayer* instance();

    void Init();

    // "/opt/GUI/Sounds/<file>" for a sound, empty for eSoundNone and any
    // value that names no sound.
    static QString soundFile(SOUNDS sound);

    // Whether a sound started by this player may still be playing.
    bool isPlaying() const;

public slots:
    void playSound(SOUNDS sound);
    // A new sound cuts the running one.
    void playSoundFile(const QString& file);
    void playSoundErrorApocalypse();
    void stopAllSounds();

private:
    void stopPlaying();

    mutable QMutex m_mutex;
    QElapsedTimer m_playing; // since the running sound started; invalid when none
    std::unique_ptr<Platform::Process> m_player; // the aplay of the running sound
};

class AudioPlayerTask : public WorkerTask<AudioPlayer>
{
public:
    static AudioPlayerTask* instance();

private:
    AudioPlayerTask();
};

#endif // AUDIOPLAYER_H
