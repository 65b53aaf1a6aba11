#ifndef SAMPLECOLORSTRIP_H
#define SAMPLECOLORSTRIP_H

#include <QVector>
#include <QWidget>

class ColorPatch;

// One sample's colours side by side, from the lowest to the highest angle,
// left to right, the patches parted by a gap of m_spacing pixels.
class SampleColorStrip : public QWidget
{
    Q_OBJECT
public:
    explicit SampleColorStrip(QWidget* parent = nullptr);

    void setSampleIndex(int index);
    int sampleIndex() const { return m_sampleIndex; }
    void setSpacing(unsigned int spacing);
    unsigned int spacing() const { return m_spacing; }
    const QVector<ColorPatch*>& colorPatches() const { return m_colorPatches; }

public slots:
    void onUpdate();

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    int m_sampleIndex = -1;
    unsigned int m_spacing = 0;
    QVector<ColorPatch*> m_colorPatches;
};

#endif // SAMPLECOLORSTRIP_H
