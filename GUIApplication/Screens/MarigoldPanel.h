#ifndef MARIGOLDPANEL_H
#define MARIGOLDPANEL_H

#include "SharedSystem/InstrumentTypes.h"

#include <QWidget>

// Root of every panel: it plays sounds through the audio thread and logs
// when it shows and when it goes.
class MarigoldPanel : public QWidget
{
    Q_OBJECT
public:
    explicit MarigoldPanel(QWidget* parent = nullptr);
    ~MarigoldPanel() override;

    void playSoundButtonClick();
    void playSoundMeasurementStarted();
    void playSoundMeasurementSuccessful();
    void playSoundMeasurementFailed();
    void playSoundJobComplete();
    void playSoundCalculationFinished();
    void playSoundErrorUser();
    // The same sound as playSoundErrorUser: the apocalypse sound is kept for
    // the player's own helper.
    void playSoundErrorApocalypse();
    void playSoundDeviceReady();
    void playSoundDevicePositioned();
    void stopAllSounds();
    // Straight to the player, on the caller's thread.
    void playSoundFile(const QString& file);

signals:
    void playASound(SOUNDS sound);

protected:
    void showEvent(QShowEvent* event) override;
};

#endif // MARIGOLDPANEL_H
