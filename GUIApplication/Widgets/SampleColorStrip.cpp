#include "Widgets/SampleColorStrip.h"

#include "GUIAPI/DataManager.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/Sample.h"
#include "Widgets/ColorPatch.h"

SampleColorStrip::SampleColorStrip(QWidget* parent)
    : QWidget(parent)
{
}

void SampleColorStrip::setSampleIndex(int index)
{
    m_sampleIndex = index;
    onUpdate();
}

void SampleColorStrip::setSpacing(unsigned int spacing)
{
    m_spacing = spacing;
    onUpdate();
}

void SampleColorStrip::resizeEvent(QResizeEvent* event)
{
    QWidget::resizeEvent(event);
    // Forms size the strip after construction; the patches follow.
    if (!m_colorPatches.isEmpty())
        onUpdate();
}

void SampleColorStrip::onUpdate()
{
    if (m_sampleIndex < 0)
        return;
    const Sample sample = DataManager::instance()->getASampleObject(static_cast<unsigned int>(m_sampleIndex));
    if (!sample.isValid())
        return;
    const int n = static_cast<int>(sample.getNumAngleCurves());

    qDeleteAll(m_colorPatches);
    m_colorPatches.clear();
    if (n <= 0)
        return;

    // A strip narrower than its gaps gives a negative width: no visible patch.
    const int spacing = static_cast<int>(m_spacing);
    const int patchWidth = (width() - spacing * n) / n;
    for (int i = 0; i < n; ++i) {
        auto* patch = new ColorPatch(this);
        patch->setColor(sample.getColor(Instrument_Get_Angle_Low_To_High(i, n)));
        patch->setGeometry(i * patchWidth + i * spacing, 0, qMax(0, patchWidth), height());
        patch->setVisible(patchWidth > 0);
        m_colorPatches.append(patch);
    }
}
