#include "Screens/MarigoldPanel.h"

#include "Utils/AudioPlayer.h"

#include <QDebug>

MarigoldPanel::MarigoldPanel(QWidget* parent)
    : QWidget(parent)
{
    // Sounds cross to the audio thread queued; the type must be known there.
    qRegisterMetaType<SOUNDS>("SOUNDS");
    connect(this, &MarigoldPanel::playASound, AudioPlayer::instance(), &AudioPlayer::playSound);
}

MarigoldPanel::~MarigoldPanel()
{
    qDebug() << QString("Removing panel %1").arg(objectName());
}

void MarigoldPanel::showEvent(QShowEvent* event)
{
    QWidget::showEvent(event);
    qDebug() << QString("Now Showing panel %1").arg(objectName());
}

void MarigoldPanel::playSoundButtonClick() { emit playASound(eSoundButtonClick); }
void MarigoldPanel::playSoundMeasurementStarted() { emit playASound(eSoundMeasurementStarted); }
void MarigoldPanel::playSoundMeasurementSuccessful() { emit playASound(eSoundMeasurementSuccessful); }
void MarigoldPanel::playSoundMeasurementFailed() { emit playASound(eSoundMeasurementFailed); }
void MarigoldPanel::playSoundJobComplete() { emit playASound(eSoundJobComplete); }
void MarigoldPanel::playSoundCalculationFinished() { emit playASound(eSoundCalculationFinished); }
void MarigoldPanel::playSoundErrorUser() { emit playASound(eSoundErrorUser); }
void MarigoldPanel::playSoundErrorApocalypse() { emit playASound(eSoundErrorUser); }
void MarigoldPanel::playSoundDeviceReady() { emit playASound(eSoundDeviceReady); }
void MarigoldPanel::playSoundDevicePositioned() { emit playASound(eSoundDevicePositioned); }
void MarigoldPanel::stopAllSounds() { emit playASound(eSoundNone); }

void MarigoldPanel::playSoundFile(const QString& file)
{
    AudioPlayer::instance()->playSoundFile(file);
}
