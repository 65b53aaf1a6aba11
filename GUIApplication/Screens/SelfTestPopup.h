#ifndef SELFTESTPOPUP_H
#define SELFTESTPOPUP_H

#include "Screens/MeasuringPopup.h"

// One long self test under way, named. The screen below decides when it
// goes: the next long test replaces it, the end of the list closes it.
class SelfTestPopup : public MeasuringPopup
{
    Q_OBJECT
public:
    SelfTestPopup(const QString& testName, SELF_TEST_TYPE type, QWidget* parent = nullptr);

    QString testName() const { return m_testName; }
    MEASURING_POPUP_STATE_T state() const { return m_state; }
    QString text() const;

public slots:
    void setState(MEASURING_POPUP_STATE_T state) override;
    void onUpdateSystemState(SYSTEM_STATE_T state) override;
    void onSelfTestTestComplete();

protected:
    void changeEvent(QEvent* event) override;

private:
    QString m_testName;
    SELF_TEST_TYPE m_testType;
    MEASURING_POPUP_STATE_T m_state = STATE_POPUP_INIT;
};

#endif // SELFTESTPOPUP_H
