#ifndef SAMPLETEXTUREPAGE_H
#define SAMPLETEXTUREPAGE_H

#include "Screens/MarigoldPanel.h"
#include "SharedSystem/InstrumentTypes.h"

class QLabel;

namespace Ui {
class SampleTexturePage;
}

// The texture figures of one camera angle: the classic four (coarseness,
// sparkle grade, density, intensity), or the instrument's named parameters.
class SampleTexturePage : public MarigoldPanel
{
    Q_OBJECT
public:
    SampleTexturePage(IMAGE_ANGLE_T angle, QWidget* parent = nullptr);
    ~SampleTexturePage() override;

    IMAGE_ANGLE_T angle() const { return m_angle; }
    static void setValueText(QLabel* label, double value);

    void setDC(double value);
    void setSG(double value);
    void setSD(double value);
    void setSI(double value);
    void setSA(double value);

    QString text(const QString& labelName) const;

public slots:
    void onUpdateTextures();

private:
    Ui::SampleTexturePage* ui;
    IMAGE_ANGLE_T m_angle;
};

#endif // SAMPLETEXTUREPAGE_H
