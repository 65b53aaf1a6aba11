#ifndef LISTINGHEADER_H
#define LISTINGHEADER_H

#include <QWidget>

class KLabel;
class QLabel;

namespace Ui {
struct ListingHeader
{
    QLabel* labelBackground = nullptr;
    KLabel* labelLeftText = nullptr;
    KLabel* labelRightText = nullptr;
    void setupUi(QWidget* header);
};
} // namespace Ui

// The section header row of a list: a left and a right caption on a light
// band, 320 x 32.
class ListingHeader : public QWidget
{
    Q_OBJECT
public:
    explicit ListingHeader(QWidget* parent = nullptr);
    ListingHeader(const QString& leftText, QWidget* parent = nullptr);
    ListingHeader(const QString& leftText, const QString& rightText, QWidget* parent = nullptr);
    ~ListingHeader() override;

    static const int Height = 32;

public slots:
    virtual void setLeftText(const QString& text);
    virtual void setRightText(const QString& text);

private:
    Ui::ListingHeader* ui;
};

#endif // LISTINGHEADER_H
