#ifndef WEBSYNCWIDGET_H
#define WEBSYNCWIDGET_H

#include <QPixmap>
#include <QStackedLayout>
#include <QString>
#include <QWidget>

class KLabel;

// The sync mark on a job row: pending, the percent sent while a transfer
// runs, or done.
class WebSyncWidget : public QWidget
{
    Q_OBJECT
public:
    explicit WebSyncWidget(QWidget* parent = nullptr);

    void setJobName(const QString& name);
    QString jobName() const { return m_JobName; }
    void setCompleted(bool completed);

    // What the mark shows now: a percent text, or empty when a picture shows.
    QString text() const;
    bool showsPicture() const;
    QPixmap picture() const;

public slots:
    void onWebSync(QString jobName, bool completed, int percentComplete);

private:
    QStackedLayout* m_pScreenStack;
    KLabel* m_pCompletedLabel;
    QString m_JobName;
};

#endif // WEBSYNCWIDGET_H
