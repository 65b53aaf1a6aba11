#ifndef SAMPLEDETAILSPAGECONTAINER_H
#define SAMPLEDETAILSPAGECONTAINER_H

#include "SharedSystem/InstrumentTypes.h"
#include "Widgets/VerticalPageContainer.h"

#include <QStringList>
#include <vector>

class ColorPatch;
class FlickButton;
class QSignalMapper;

// Pages of figures stacked vertically, with a column of buttons at the
// left that picks a page; the button of the page in view is marked.
class SampleDetailsPageContainer : public VerticalPageContainer
{
    Q_OBJECT
public:
    static const int ButtonWidth = 112;

    explicit SampleDetailsPageContainer(QWidget* parent = nullptr);
    ~SampleDetailsPageContainer() override;

    const std::vector<FlickButton*>& pageButtons() const { return m_pageButtons; }
    QStringList buttonStrings() const { return m_buttonStrings; }
    int buttonWidth() const { return m_buttonWidth; }

public slots:
    void appendPage(QWidget* page) override;
    void updatePage() override;
    virtual void drawButtons();
    virtual void removeAllButtons();
    virtual void removeButton(int index);
    virtual void onSelectPageWithSlide(int index);

protected:
    // Places a page right of the buttons, as high as the container.
    void fitPage(QWidget* page);
    int buttonHeight() const;
    void changeEvent(QEvent* event) override;
    // The button texts in the language now loaded, in page order.
    virtual QStringList translatedButtonStrings() const { return m_buttonStrings; }

    std::vector<FlickButton*> m_pageButtons;
    QStringList m_buttonStrings;
    int m_buttonWidth;
    QSignalMapper* m_signalMapper;
};

// Colour figures per reflectance angle; each button carries the angle's colour.
class SampleDetailsPageContainerDNumber : public SampleDetailsPageContainer
{
    Q_OBJECT
public:
    explicit SampleDetailsPageContainerDNumber(QWidget* parent = nullptr);

    using SampleDetailsPageContainer::appendPage;
    void appendPage(REFL_ANGLE_T angle);
    const std::vector<REFL_ANGLE_T>& buttonAngles() const { return m_buttonAngles; }
    const std::vector<ColorPatch*>& colorPatches() const { return m_colorPatches; }

public slots:
    void drawButtons() override;
    void removeAllButtons() override;
    void removeAllColorPatches();
    void updatePage() override;

protected:
    QStringList translatedButtonStrings() const override;

private:
    static QString buttonString(REFL_ANGLE_T angle);

    std::vector<REFL_ANGLE_T> m_buttonAngles;
    std::vector<ColorPatch*> m_colorPatches;
};

class SampleDetailsPageContainerD45 : public SampleDetailsPageContainerDNumber
{
    Q_OBJECT
public:
    explicit SampleDetailsPageContainerD45(QWidget* parent = nullptr);
};

class SampleDetailsPageContainerD15 : public SampleDetailsPageContainerDNumber
{
    Q_OBJECT
public:
    explicit SampleDetailsPageContainerD15(QWidget* parent = nullptr);
};

// Texture figures per camera angle.
class SampleDetailsPageContainerTexture : public SampleDetailsPageContainer
{
    Q_OBJECT
public:
    explicit SampleDetailsPageContainerTexture(QWidget* parent = nullptr);

    using SampleDetailsPageContainer::appendPage;
    void appendPage(IMAGE_ANGLE_T angle);

protected:
    QStringList translatedButtonStrings() const override;

private:
    std::vector<IMAGE_ANGLE_T> m_imageAngles;
};

#endif // SAMPLEDETAILSPAGECONTAINER_H
