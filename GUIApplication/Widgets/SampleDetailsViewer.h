#ifndef SAMPLEDETAILSVIEWER_H
#define SAMPLEDETAILSVIEWER_H

#include "SharedSystem/InstrumentTypes.h"
#include "Widgets/SamplePage.h"

class SampleDetailsPageContainer;

namespace Ui {
class SampleDetailsViewer;
}

// A page of the sample view that holds a column of figure pages: a title,
// the illuminant and observer (or the texture's version), and the edge
// arrows to the neighbouring pages.
class SampleDetailsViewer : public SamplePage
{
    Q_OBJECT
public:
    explicit SampleDetailsViewer(QWidget* parent = nullptr);
    ~SampleDetailsViewer() override;

    void setLeftButtonEnabled(bool enabled);
    void setRightButtonEnabled(bool enabled);
    bool isLeftButtonEnabled() const;
    bool isRightButtonEnabled() const;
    void setTitle(const QString& title);
    QString title() const;
    void setIllumObs(COLOR_ILLUM_OBS_T illumObs);
    void setIllumObsText(const QString& text);
    QString illumObsText() const;

    SampleDetailsPageContainer* pageContainer() const { return m_pageContainer; }
    void clearPageContainer();
    virtual void addPageContainer(SampleDetailsPageContainer* container);

public slots:
    void on_BtnPageRight_clicked();
    void on_BtnPageLeft_clicked();

protected:
    void changeEvent(QEvent* event) override;
    // The box the figure pages are built in.
    QWidget* pageHolder() const;
    virtual void retranslate() {}

    Ui::SampleDetailsViewer* ui;
    SampleDetailsPageContainer* m_pageContainer;
};

// Colour figures: titled by the illumination angle, with the user's
// illuminant and observer.
class SampleDetailsViewerDNumber : public SampleDetailsViewer
{
    Q_OBJECT
public:
    explicit SampleDetailsViewerDNumber(QWidget* parent = nullptr);
};

class SampleDetailsViewerD45 : public SampleDetailsViewerDNumber
{
    Q_OBJECT
public:
    explicit SampleDetailsViewerD45(QWidget* parent = nullptr);

protected:
    void retranslate() override;
};

class SampleDetailsViewerD15 : public SampleDetailsViewerDNumber
{
    Q_OBJECT
public:
    explicit SampleDetailsViewerD15(QWidget* parent = nullptr);

protected:
    void retranslate() override;
};

class SampleDetailsViewerTexture : public SampleDetailsViewer
{
    Q_OBJECT
public:
    explicit SampleDetailsViewerTexture(QWidget* parent = nullptr);

public slots:
    void OnPageChanged(int page);

protected:
    void retranslate() override;
};

#endif // SAMPLEDETAILSVIEWER_H
