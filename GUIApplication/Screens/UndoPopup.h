#ifndef UNDOPOPUP_H
#define UNDOPOPUP_H

#include "Screens/MarigoldFullScreenPanel.h"

class KLabel;
class QLabel;
class XPushButton;

namespace Ui {
struct UndoPopup
{
    QLabel* labelBackground = nullptr;
    QLabel* icnPopupBkgnd = nullptr;
    KLabel* labelText = nullptr;
    XPushButton* BtnUndo = nullptr;
    XPushButton* BtnBack = nullptr;
    void setupUi(QWidget* popup);
    void retranslateUi(QWidget* popup);
};
} // namespace Ui

// Offers to take back what was just done.
class UndoPopup : public MarigoldFullScreenPanel
{
    Q_OBJECT
public:
    explicit UndoPopup(QWidget* parent = nullptr);
    ~UndoPopup() override;

    void setPopupText(const QString& text);

signals:
    void undo();
    void back();

protected:
    void changeEvent(QEvent* event) override;

private:
    Ui::UndoPopup* ui;
};

#endif // UNDOPOPUP_H
