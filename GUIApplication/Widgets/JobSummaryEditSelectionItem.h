#ifndef JOBSUMMARYEDITSELECTIONITEM_H
#define JOBSUMMARYEDITSELECTIONITEM_H

#include "Widgets/FlickButton.h"

namespace Ui {
class JobSummaryEditSelectionItem;
}

class KLabel;

// A detail row of the job summary: what the field is, above its value. An
// editable row carries the pencil and a pressed state and clicks; a row that
// may not be edited is plain text and swallows taps.
class JobSummaryEditSelectionItem : public FlickButton
{
    Q_OBJECT
public:
    JobSummaryEditSelectionItem(const QString& description, const QString& value, QWidget* parent = nullptr,
                                bool editable = false);
    ~JobSummaryEditSelectionItem() override;

    void setIsEditable(bool editable);
    bool isEditable() const { return m_editable; }

    void setDescription(const QString& text);
    void setValue(const QString& text);
    void setMaxTextLength(int length);
    void setAutoSize(bool autoSize);

    QString description() const;
    // The full value, also when the label shows only part of it.
    QString value() const;
    KLabel* valueLabel() const;
    bool isEditMarkerShown() const;

public slots:
    void sendClick() override;

private:
    Ui::JobSummaryEditSelectionItem* ui;
    bool m_editable = false;
};

#endif // JOBSUMMARYEDITSELECTIONITEM_H
