#ifndef JOBMEASURELISTINGHEADER_H
#define JOBMEASURELISTINGHEADER_H

#include "SharedSystem/InstrumentTypes.h"

#include <QWidget>

namespace Ui {
class JobMeasureListingHeader;
}

class WebSyncWidget;

// The section header over a job's details. It carries the job's sync mark
// on the right, shown under the same Wi-Fi rule as the marks of the job
// rows on the home screen.
class JobMeasureListingHeader : public QWidget
{
    Q_OBJECT
public:
    explicit JobMeasureListingHeader(const QString& text, QWidget* parent = nullptr);
    ~JobMeasureListingHeader() override;

    void setText(const QString& text);
    QString text() const;
    // The job whose transfer the mark follows, and whether it is on the
    // server already.
    void setJob(const QString& name, bool synchronised);
    WebSyncWidget* webSyncWidget() const;

public slots:
    void onWifiStateChanged(WIFI_STATUS_T state);

private:
    Ui::JobMeasureListingHeader* ui;
};

#endif // JOBMEASURELISTINGHEADER_H
