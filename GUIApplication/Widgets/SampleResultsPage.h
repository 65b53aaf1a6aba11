#ifndef SAMPLERESULTSPAGE_H
#define SAMPLERESULTSPAGE_H

#include "Widgets/SamplePage.h"

#include <QSignalMapper>
#include <QTimer>
#include <QVector>

class ClickableLabel;
class QLabel;

namespace Ui {
class SampleResultsPage;
}

// The first page of a sample: the rainbow chart with the colour strip, and
// a row of camera thumbnails that open the image view on their picture.
class SampleResultsPage : public SamplePage
{
    Q_OBJECT
public:
    static const int DebounceMs = 200;

    explicit SampleResultsPage(QWidget* parent = nullptr);
    ~SampleResultsPage() override;

    void setRightButtonEnabled(bool enabled);
    bool isRightButtonEnabled() const;
    const QVector<ClickableLabel*>& thumbnails() const { return m_thumbnails; }
    const QVector<QLabel*>& thumbnailLabels() const { return m_thumbnailLabels; }

signals:
    void gotoImageViewScreen();

public slots:
    void onLoadCurrentSamplesImagesComplete();
    void onThumbnailSelected(int index);
    void onDebounceTimeout();
    void on_BtnPageRight_clicked();
    void on_BtnZoomIn_clicked();

protected:
    void changeEvent(QEvent* event) override;

private:
    void onCreatePage();
    void setThumbnailsEnabled(bool enabled);

    Ui::SampleResultsPage* ui;
    QVector<ClickableLabel*> m_thumbnails;
    QVector<QLabel*> m_thumbnailLabels;
    QSignalMapper m_signalMapper;
    QTimer m_debounceTimer;
};

#endif // SAMPLERESULTSPAGE_H
