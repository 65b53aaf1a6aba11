#include "Screens/SelfTestScreen.h"

#include "ui_SelfTestScreen.h"

#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/DataManager.h"
#include "GUIAPI/MeasureAPI.h"
#include "Screens/SelfTestPopup.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/StringTables.h"
#include "Widgets/FlickList.h"
#include "Widgets/SelfTestListItem.h"
#include "Widgets/Theme.h"

#include <QDebug>
#include <QEvent>
#include <QPointer>

namespace {
const unsigned int kCanceled = 3;
const unsigned int kFirstIssueCode = 1001;
// A test this long or shorter runs without a popup of its own.
const unsigned int kPopupAboveMs = 1000;
const int kIdlePollMs = 100;
const int kStartDelayMs = 300;

struct NameText
{
    const char* name;
    const char* text;
};

const NameText kTestNames[] = {
    {"WHITE TRANSFER", QT_TRANSLATE_NOOP("SelfTestScreen", "White Calibration")},
    {"REFERENCE CHECK ON WHITE", QT_TRANSLATE_NOOP("SelfTestScreen", "Reference check on white")},
    {"EFFECT TILE TEST", QT_TRANSLATE_NOOP("SelfTestScreen", "Effect tile test")},
    {"REPEATABILITY TESTS", QT_TRANSLATE_NOOP("SelfTestScreen", "Repeatability tests")},
    {"TEMPERATURE TESTS", QT_TRANSLATE_NOOP("SelfTestScreen", "Temperature tests")},
    {"PRESSURE SENSOR TEST", QT_TRANSLATE_NOOP("SelfTestScreen", "Pressure sensor test")},
    {"CHECK ERROR LOGS", QT_TRANSLATE_NOOP("SelfTestScreen", "Check error logs")},
};
} // namespace

SelfTestScreen::SelfTestScreen(SELF_TEST_TYPE type, QWidget* parent)
    : DaddyPanel(parent)
    , ui(new Ui::SelfTestScreen)
    , m_testType(type)
{
    ui->setupUi(this);
    setObjectName(QStringLiteral("SelfTestScreen"));
    setAttribute(Qt::WA_StyledBackground, true);
    ui->labelTitle->setAutoSize(true);
    ui->labelStatus->setAutoSize(true);
    Theme::styleButton(ui->okBtn, Theme::PrimaryButton);
    ui->listTests->setBackgroundStyleSheet(QStringLiteral("background-color: rgb(230, 231, 232); border: none;"));
    ui->okBtn->hide();
    const int typeIndex = int(type);
    ui->labelTitle->setText(getStringFromList(typeIndex, SELF_TEST_TYPES_TABLE));

    m_tests = DataManager::instance()->getTests(typeIndex);
    connect(API_SignalMaster::instance(), &API_SignalMaster::SelfTestTestComplete, this,
            &SelfTestScreen::onTestComplete);
    m_timer.setSingleShot(true);
    connect(&m_timer, &QTimer::timeout, this, &SelfTestScreen::onStartTests);
    for (const TEST& test : m_tests)
        ui->listTests->addWidget(new SelfTestListItem(test.description, mapTestName(test.description)));
}

SelfTestScreen::~SelfTestScreen()
{
    m_timer.stop();
    delete ui;
}

QString SelfTestScreen::mapTestName(const QString& name)
{
    for (const NameText& entry : kTestNames) {
        if (name == QLatin1String(entry.name))
            return QCoreApplication::translate("SelfTestScreen", entry.text);
    }
    qDebug() << "Test Name not translated: " << name;
    return name;
}

int SelfTestScreen::rowCount() const
{
    return ui->listTests->count();
}

SelfTestListItem* SelfTestScreen::row(int index) const
{
    return qobject_cast<SelfTestListItem*>(ui->listTests->getWidget(index));
}

QString SelfTestScreen::statusText() const
{
    return ui->labelStatus->defaultText();
}

bool SelfTestScreen::isOkShown() const
{
    return !ui->okBtn->isHidden();
}

void SelfTestScreen::setStatus(std::function<QString()> text)
{
    m_status = std::move(text);
    ui->labelStatus->setText(m_status ? m_status() : QString());
}

void SelfTestScreen::showEvent(QShowEvent* event)
{
    DaddyPanel::showEvent(event);
    // Once: the tests begin when the screen stands, not at each re-show.
    if (!m_started) {
        m_started = true;
        m_timer.start(kStartDelayMs);
    }
}

void SelfTestScreen::onStartTests()
{
    ui->okBtn->hide();
    m_testCounter = 0;
    setStatus([] { return tr("Testing..."); });
    doNextTest();
}

void SelfTestScreen::closeSelfTestPopup()
{
    if (!m_selfTestPopup)
        return;
    SelfTestPopup* popup = m_selfTestPopup;
    m_selfTestPopup = nullptr;
    DaddyPanel::onClosePopup(popup);
}

void SelfTestScreen::doNextTest()
{
    if (m_testCounter >= 0 && m_testCounter < m_tests.size()) {
        const TEST test = m_tests[m_testCounter];
        if (test.approxDuration > kPopupAboveMs) {
            closeSelfTestPopup();
            m_selfTestPopup = new SelfTestPopup(mapTestName(test.description), m_testType, parentWidget());
            connect(m_selfTestPopup, &PopupPanel::closePopup, this,
                    qOverload<PopupPanel*>(&SelfTestScreen::onClosePopup));
            onAddPopup(m_selfTestPopup);
        }
        // The screen may go while the instrument finishes something else.
        QPointer<SelfTestScreen> self(this);
        while (self && !self->isClosing()
               && DataManager::instance()->getSystemStatus().getSystemState() != STATE_INIT)
            Delay(kIdlePollMs);
        if (!self || self->isClosing())
            return;
        ++m_testCounter;
        MeasAPI_TriggerSelfTest(test);
        return;
    }
    if (ui->okBtn->isHidden())
        closeSelfTestPopup();
    const SELF_TEST_TYPE type = m_testType;
    if (type == SELF_TEST_DEVICE_LIFTED)
        setStatus([] { return tr("All Tests Complete"); });
    else
        setStatus([type] { return getStringFromList(int(type), SELF_TEST_TYPES_COMPLETE_TABLE); });
    ui->okBtn->show();
    ++m_testCounter;
}

void SelfTestScreen::onTestComplete(TEST test, unsigned int result)
{
    for (int i = 0; i < rowCount(); ++i) {
        SelfTestListItem* item = row(i);
        if (item && item->getTestName() == test.description) {
            item->setResult(result);
            ui->listTests->scrollToItem(ui->listTests->item(i));
            break;
        }
    }
    if (result == kCanceled) {
        setStatus([] { return tr("Self Tests Canceled"); });
        ui->okBtn->show();
        closeSelfTestPopup();
        return;
    }
    if (result < kFirstIssueCode) {
        doNextTest();
        return;
    }
    closeSelfTestPopup();
    // The run goes on when the error has been read; an issue without a
    // popup of its own doesn't hold it up.
    if (!onMeasurementIssue(int(result)))
        QMetaObject::invokeMethod(this, &SelfTestScreen::doNextTest, Qt::QueuedConnection);
}

void SelfTestScreen::onClosePopup(PopupPanel* popup)
{
    if (!popup)
        popup = qobject_cast<PopupPanel*>(sender());
    if (!popup)
        return;
    const bool wasError = popup->objectName() == QLatin1String("ErrorPopup");
    if (popup == m_selfTestPopup)
        m_selfTestPopup = nullptr;
    DaddyPanel::onClosePopup(popup);
    if (wasError)
        QMetaObject::invokeMethod(this, &SelfTestScreen::doNextTest, Qt::QueuedConnection);
}

void SelfTestScreen::onUpdateSystemState(SYSTEM_STATE_T)
{
    // Nothing: no cover may hide the list while the tests run.
}

void SelfTestScreen::on_okBtn_clicked()
{
    playSoundButtonClick();
    API_SignalMaster* hub = API_SignalMaster::instance();
    if (m_testType == SELF_TEST_EFFECT_TILE)
        hub->emitSelfTestReferenceComplete();
    else if (m_testType == SELF_TEST_DEVICE_LIFTED)
        hub->emitSelfTestOtherComplete();
    else
        hub->emitSelfTestWhiteComplete();
    CloseScreen();
}

void SelfTestScreen::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange) {
        ui->retranslateUi(this);
        ui->labelTitle->setText(getStringFromList(int(m_testType), SELF_TEST_TYPES_TABLE));
        if (m_status)
            ui->labelStatus->setText(m_status());
    }
    DaddyPanel::changeEvent(event);
}
