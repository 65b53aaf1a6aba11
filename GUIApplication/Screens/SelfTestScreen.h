#ifndef SELFTESTSCREEN_H
#define SELFTESTSCREEN_H

#include "Screens/DaddyPanel.h"
#include "SharedSystem/InstrumentTypes.h"

#include <QTimer>
#include <QVector>

#include <functional>

namespace Ui {
class SelfTestScreen;
}

class SelfTestListItem;
class SelfTestPopup;

// Runs the self tests of one set-up in the instrument's order and shows
// each result in the list.
class SelfTestScreen : public DaddyPanel
{
    Q_OBJECT
public:
    SelfTestScreen(SELF_TEST_TYPE type, QWidget* parent = nullptr);
    ~SelfTestScreen() override;

    // The text shown for a test name the instrument sends.
    static QString mapTestName(const QString& name);

    SELF_TEST_TYPE testType() const { return m_testType; }
    int testCounter() const { return m_testCounter; }
    int rowCount() const;
    SelfTestListItem* row(int index) const;
    SelfTestPopup* selfTestPopup() const { return m_selfTestPopup; }
    QString statusText() const;
    bool isOkShown() const;

public slots:
    void onTestComplete(TEST test, unsigned int result);
    void doNextTest();
    void onUpdateSystemState(SYSTEM_STATE_T state) override;
    void onClosePopup(PopupPanel* popup) override;
    void onClosePopup() override { DaddyPanel::onClosePopup(); }
    virtual void onStartTests();

protected:
    void showEvent(QShowEvent* event) override;
    void changeEvent(QEvent* event) override;

private slots:
    void on_okBtn_clicked();

protected:
    void closeSelfTestPopup();
    void setStatus(std::function<QString()> text);

    Ui::SelfTestScreen* ui;
    SELF_TEST_TYPE m_testType;
    SelfTestPopup* m_selfTestPopup = nullptr;
    int m_testCounter = 0;
    QVector<TEST> m_tests;
    QTimer m_timer;
    bool m_started = false;
    std::function<QString()> m_status;
};

#endif // SELFTESTSCREEN_H
