#include "Screens/CalibrationWizardScreen.h"

#include "ui_CalibrationWizardScreen.h"

#include "Commands/TargetingOutCommands.h"
#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/DataManager.h"
#include "Screens/CalibrationPopup.h"
#include "Screens/CalibrationSensorPopup.h"
#include "SharedSystem/StringTables.h"
#include "Widgets/CalibrationWizardPageContainer.h"
#include "Widgets/Theme.h"

#include <QEvent>
#include <QKeyEvent>

namespace {

QString selfTestName(int type)
{
    return getStringFromList(type, SELF_TEST_TYPES_TABLE);
}

} // namespace

CalibrationWizardScreen::CalibrationWizardScreen(CALIBRATION_STATES state, QWidget* parent)
    : DaddyPanel(parent)
    , ui(new Ui::CalibrationWizardScreen)
{
    ui->setupUi(this);
    setObjectName(QStringLiteral("CalibrationWizardScreen"));
    setAutoFillBackground(true);
    QPalette ground = palette();
    ground.setColor(QPalette::Window, QColor(245, 245, 246));
    setPalette(ground);
    // A long translated title takes two lines before it gets smaller.
    Theme::keepBetweenHeaderDividers(ui->TxtTitle);
    ui->TxtTitle->setWordWrap(true);
    ui->TxtTitle->setAutoSize(true);

    API_SignalMaster* hub = API_SignalMaster::instance();
    connect(hub, &API_SignalMaster::CalibrationComplete, this, &CalibrationWizardScreen::onCalibrationComplete);
    connect(hub, &API_SignalMaster::ReferenceCheckComplete, this, &CalibrationWizardScreen::onCalibrationComplete);
    connect(hub, &API_SignalMaster::SelfTestWhiteComplete, this, &CalibrationWizardScreen::onCalibrationComplete);
    connect(hub, &API_SignalMaster::SelfTestReferenceComplete, this,
            &CalibrationWizardScreen::onCalibrationComplete);
    connect(hub, &API_SignalMaster::SelfTestOtherComplete, this, &DaddyPanel::CloseScreen);

    if (state < CALIBRATION_WHITE_STATE || state >= NUM_CALIBRATION_STATES)
        state = CALIBRATION_WHITE_STATE;
    enterState(state);
}

CalibrationWizardScreen::~CalibrationWizardScreen()
{
    closeCalibrationPopup();
    closeSensorPopup();
    delete ui;
}

QString CalibrationWizardScreen::getSelfTestTitle(int number, const QString& name)
{
    return tr("Self Test %1: %2").arg(number).arg(name);
}

QString CalibrationWizardScreen::title() const
{
    return ui->TxtTitle->defaultText();
}

bool CalibrationWizardScreen::isBackButtonShown() const
{
    return !ui->BtnBack->isHidden();
}

void CalibrationWizardScreen::setTitle(std::function<QString()> title)
{
    m_title = std::move(title);
    ui->TxtTitle->setText(m_title());
}

void CalibrationWizardScreen::enterState(CALIBRATION_STATES state)
{
    m_calibrationState = state;
    switch (state) {
    case CALIBRATION_WHITE_STATE:
        setTitle([] { return tr("Calibration"); });
        break;
    case CALIBRATION_REFERENCE_CHECK_STATE:
        setTitle([] { return tr("Reference Tile Check"); });
        break;
    case CALIBRATION_SELF_TEST_WHITE_STATE:
        setTitle([] { return getSelfTestTitle(1, selfTestName(SELF_TEST_WHITE_TILE)); });
        break;
    case CALIBRATION_SELF_TEST_REFERENCE_CHECK_STATE:
        setTitle([] { return getSelfTestTitle(2, selfTestName(SELF_TEST_EFFECT_TILE)); });
        break;
    case CALIBRATION_SELF_TEST_OTHER_STATE:
        setTitle([] { return getSelfTestTitle(3, selfTestName(SELF_TEST_DEVICE_LIFTED)); });
        break;
    default:
        break;
    }
    createWizardPageContainer(state);
}

void CalibrationWizardScreen::createWizardPageContainer(CALIBRATION_STATES state)
{
    if (m_pPageContainer) {
        m_pPageContainer->disconnect(this);
        m_pPageContainer->hide();
        m_pPageContainer->deleteLater();
        m_pPageContainer = nullptr;
    }
    switch (state) {
    case CALIBRATION_WHITE_STATE: m_pPageContainer = new CalibrationWhiteWizardPageContainer(this); break;
    case CALIBRATION_REFERENCE_CHECK_STATE:
        m_pPageContainer = new CalibrationReferenceWizardPageContainer(this);
        break;
    case CALIBRATION_SELF_TEST_WHITE_STATE:
        m_pPageContainer = new CalibrationSelfTestWhiteWizardPageContainer(this);
        break;
    case CALIBRATION_SELF_TEST_REFERENCE_CHECK_STATE:
        m_pPageContainer = new CalibrationSelfTestReferenceWizardPageContainer(this);
        break;
    case CALIBRATION_SELF_TEST_OTHER_STATE:
        m_pPageContainer = new CalibrationSelfTestOtherWizardPageContainer(this);
        break;
    default: return;
    }
    m_pPageContainer->setObjectName(QStringLiteral("PageContainer"));
    m_pPageContainer->setGeometry(0, 66, 320, 414);
    m_pPageContainer->show();
    m_pPageContainer->raise();
    connect(m_pPageContainer, &CalibrationWizardPageContainer::calibrationClicked, this,
            &CalibrationWizardScreen::onShowCalibrationPopup);
}

// ---- Starting -------------------------------------------------------------------------

void CalibrationWizardScreen::on_BtnCalibrate_clicked()
{
    playSoundButtonClick();
    if (!popups().empty())
        return;
    onShowCalibrationPopup();
}

void CalibrationWizardScreen::keyPressEvent(QKeyEvent* event)
{
    // The read switch starts the step, unless a popup is up (the countdown
    // among them).
    if (event->key() == Qt::Key_Return && isActive() && !event->isAutoRepeat() && popups().empty()) {
        DaddyPanel::keyPressEvent(event);
        onShowCalibrationPopup();
        return;
    }
    DaddyPanel::keyPressEvent(event);
}

bool CalibrationWizardScreen::validPressureSensors()
{
    PRESSURE_SWITCH_T sensors;
    if (CmdOut_GetPressureSensor(sensors) != 0)
        return false;
    return sensors.Switch1 != 0 && sensors.Switch2 != 0 && sensors.Switch3 != 0;
}

void CalibrationWizardScreen::onShowCalibrationPopup()
{
    if (m_calibrationState == CALIBRATION_SELF_TEST_OTHER_STATE) {
        onGotoCalibratingPopup();
        return;
    }
    if (validPressureSensors())
        onGotoCalibratingPopup();
    else
        onGotoSensorWarningPopup();
}

void CalibrationWizardScreen::onGotoCalibratingPopup()
{
    m_bCalibrating = true;
    closeSensorPopup();
    closeCalibrationPopup();
    switch (m_calibrationState) {
    case CALIBRATION_WHITE_STATE:
        m_pCalibrationPopup = new CalibrationPopup(parentWidget());
        break;
    case CALIBRATION_REFERENCE_CHECK_STATE:
        m_pCalibrationPopup = new CalibrationReferenceCheckPopup(parentWidget());
        ui->BtnBack->show();
        break;
    case CALIBRATION_SELF_TEST_WHITE_STATE:
        GotoScreen(SELF_TEST_SCREEN_WHITE_ID);
        return;
    case CALIBRATION_SELF_TEST_REFERENCE_CHECK_STATE:
        GotoScreen(SELF_TEST_SCREEN_EFFECT_ID);
        return;
    case CALIBRATION_SELF_TEST_OTHER_STATE:
        GotoScreen(SELF_TEST_SCREEN_LIFTED_ID);
        return;
    default:
        return;
    }
    connect(m_pCalibrationPopup, &PopupPanel::closePopup, this, &CalibrationWizardScreen::onCloseCalibrationPopup);
    onAddPopup(m_pCalibrationPopup);
}

void CalibrationWizardScreen::onGotoSensorWarningPopup()
{
    closeSensorPopup();
    m_pSensorPopup = new CalibrationSensorPopup(parentWidget());
    connect(m_pSensorPopup, &PopupPanel::closePopup, this, &CalibrationWizardScreen::onSensorPopupOkay);
    connect(m_pSensorPopup, &CalibrationSensorPopup::cancelPopup, this,
            &CalibrationWizardScreen::onSensorPopupCancel);
    onAddPopup(m_pSensorPopup);
}

void CalibrationWizardScreen::onSensorPopupOkay(PopupPanel* popup)
{
    if (popup != m_pSensorPopup)
        return;
    closeSensorPopup();
    // Checked again: the next warning comes up if a foot is still off.
    onShowCalibrationPopup();
}

void CalibrationWizardScreen::onSensorPopupCancel(PopupPanel* popup)
{
    if (popup == m_pSensorPopup)
        closeSensorPopup();
}

// Popups are deleted from the event loop: they ask to be closed from inside
// their own timers and buttons.
void CalibrationWizardScreen::closeSensorPopup()
{
    if (!m_pSensorPopup)
        return;
    m_pSensorPopup->hide();
    // Only its requests: the popup list still hears of its end.
    disconnect(m_pSensorPopup, &PopupPanel::closePopup, this, nullptr);
    disconnect(m_pSensorPopup, &CalibrationSensorPopup::cancelPopup, this, nullptr);
    m_pSensorPopup->deleteLater();
    m_pSensorPopup = nullptr;
}

void CalibrationWizardScreen::closeCalibrationPopup()
{
    if (!m_pCalibrationPopup)
        return;
    m_pCalibrationPopup->hide();
    disconnect(m_pCalibrationPopup, &PopupPanel::closePopup, this, nullptr);
    m_pCalibrationPopup->deleteLater();
    m_pCalibrationPopup = nullptr;
}

void CalibrationWizardScreen::onCloseCalibrationPopup(PopupPanel* popup)
{
    if (popup && popup == m_pCalibrationPopup)
        closeCalibrationPopup();
}

// ---- The instrument's news ----------------------------------------------------------

void CalibrationWizardScreen::onCalibrationComplete()
{
    m_bCalibrating = false;
    DataManager* data = DataManager::instance();
    switch (m_calibrationState) {
    case CALIBRATION_WHITE_STATE:
        // Straight on to the reference check; the way out is through it.
        enterState(CALIBRATION_REFERENCE_CHECK_STATE);
        ui->BtnBack->hide();
        break;
    case CALIBRATION_REFERENCE_CHECK_STATE:
        CloseScreen();
        break;
    case CALIBRATION_SELF_TEST_WHITE_STATE:
        if (!data->getTests(SELF_TEST_EFFECT_TILE).isEmpty())
            enterState(CALIBRATION_SELF_TEST_REFERENCE_CHECK_STATE);
        else if (!data->getTests(SELF_TEST_DEVICE_LIFTED).isEmpty())
            enterState(CALIBRATION_SELF_TEST_OTHER_STATE);
        else
            CloseScreen();
        break;
    case CALIBRATION_SELF_TEST_REFERENCE_CHECK_STATE:
        if (data->getTests(SELF_TEST_DEVICE_LIFTED).isEmpty())
            CloseScreen();
        else
            enterState(CALIBRATION_SELF_TEST_OTHER_STATE);
        break;
    default:
        // The lifted set-up ends with its own signal.
        break;
    }
}

PopupPanel* CalibrationWizardScreen::onMeasurementIssue(int code)
{
    // The wizard stays on its pages for another try.
    closeCalibrationPopup();
    return DaddyPanel::onMeasurementIssue(code);
}

void CalibrationWizardScreen::onUpdateSystemState(SYSTEM_STATE_T state)
{
    if (!isActive())
        return;
    // Our own calibration has its popup; no "Calibrating" cover over it.
    if (state == STATE_CALIBRATING && m_bCalibrating)
        return;
    DaddyPanel::onUpdateSystemState(state);
}

void CalibrationWizardScreen::on_BtnBack_clicked()
{
    playSoundButtonClick();
    CloseScreen();
}

void CalibrationWizardScreen::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange && m_title)
        ui->TxtTitle->setText(m_title());
    DaddyPanel::changeEvent(event);
}
