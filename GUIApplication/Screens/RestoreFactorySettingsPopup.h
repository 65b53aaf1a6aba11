#ifndef RESTOREFACTORYSETTINGSPOPUP_H
#define RESTOREFACTORYSETTINGSPOPUP_H

#include "Screens/DaddyPanel.h"

namespace Ui {
class RestoreFactorySettingsPopup;
}

class ConfirmationCircleWidget;

// Asks for a factory reset, confirmed by a turn of the dot around the
// circle. Everything on the instrument goes back to its first state.
class RestoreFactorySettingsPopup : public DaddyPanel
{
    Q_OBJECT
public:
    explicit RestoreFactorySettingsPopup(QWidget* parent = nullptr);
    ~RestoreFactorySettingsPopup() override;

    ConfirmationCircleWidget* confirmationCircle() const;
    QString titleText() const;
    QString descriptionText() const;

public slots:
    virtual void onConfirmed();
    void on_BtnBack_clicked();

protected:
    void changeEvent(QEvent* event) override;
    void setTexts(const QString& title, const QString& description);
    virtual void retranslate();

    Ui::RestoreFactorySettingsPopup* ui;
};

// Clears every job and sample from the instrument, behind the same gesture.
class DeleteAllSamplesPopup : public RestoreFactorySettingsPopup
{
    Q_OBJECT
public:
    // Beyond this the busy cover goes even if the server never says so.
    static const int WipeTimeoutMs = 30000;

    explicit DeleteAllSamplesPopup(QWidget* parent = nullptr);

public slots:
    void onConfirmed() override;
    void onDataBaseWiped();

protected:
    void retranslate() override;

private:
    bool m_wiping = false;
};

#endif // RESTOREFACTORYSETTINGSPOPUP_H
