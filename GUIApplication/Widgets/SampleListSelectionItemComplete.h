#ifndef SAMPLELISTSELECTIONITEMCOMPLETE_H
#define SAMPLELISTSELECTIONITEMCOMPLETE_H

#include <QWidget>

namespace Ui {
class SampleListSelectionItemComplete;
}

// The row under the results of a job that still lacks readings.
class SampleListSelectionItemComplete : public QWidget
{
    Q_OBJECT
public:
    explicit SampleListSelectionItemComplete(QWidget* parent = nullptr);
    ~SampleListSelectionItemComplete() override;

    QString message() const;

protected:
    void changeEvent(QEvent* event) override;

private:
    Ui::SampleListSelectionItemComplete* ui;
};

#endif // SAMPLELISTSELECTIONITEMCOMPLETE_H
