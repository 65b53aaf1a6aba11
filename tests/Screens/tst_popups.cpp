// The popups and covers: their texts, which signal each button raises,
// which buttons click audibly, and how the hidden corner sends a popup home.

#include "GUIAPI/API_SignalMaster.h"
#include "Screens/DeletePopup.h"
#include "Screens/ErrorPopup.h"
#include "Screens/LockScreen.h"
#include "Screens/NotificationPopup.h"
#include "Screens/OverridePopup.h"
#include "Screens/PowerDownPopup.h"
#include "Screens/SadPuppyScreen.h"
#include "Screens/SyncScreen.h"
#include "Screens/TerminateJobPopup.h"
#include "Screens/UndoPopup.h"
#include "SharedSystem/Platform.h"
#include "Widgets/KLabel.h"
#include "Widgets/XPushButton.h"

#include <QSignalSpy>
#include <QPointer>
#include <QTranslator>
#include "Screens/ScreenMaster.h"
#include "Widgets/SpinnyCircle.h"
#include <QtTest>

namespace {

QString played(const QString& file)
{
    return "aplay -N " + Platform::devicePath("/opt/GUI/Sounds/" + file);
}

int clicks()
{
    return Platform::recordedCommands().count(played("click.wav"));
}

// Sounds travel to the audio thread; give them time to arrive.
void settleSounds()
{
    QTest::qWait(100);
}

void press(QWidget* popup, const char* button)
{
    auto* b = popup->findChild<XPushButton*>(button);
    QVERIFY2(b, button);
    QTest::mouseClick(b, Qt::LeftButton);
}

QString labelText(QWidget* popup, const char* label)
{
    auto* l = popup->findChild<KLabel*>(label);
    return l ? l->defaultText() : QString("<no %1>").arg(label);
}

QString buttonText(QWidget* popup, const char* button)
{
    auto* b = popup->findChild<XPushButton*>(button);
    return b ? b->text() : QString("<no %1>").arg(button);
}

} // namespace

class TestPopups : public QObject
{
    Q_OBJECT

private slots:
    void init() { Platform::clearRecordedCommands(); }

    void notificationAndErrorPopups()
    {
        NotificationPopup note;
        QCOMPARE(note.objectName(), QString("NotificationPopup"));
        QCOMPARE(note.size(), QSize(320, 480));
        note.setHeaderText("Warning");
        note.setMessageText("Low Storage");
        note.setButtonText("OK");
        QCOMPARE(note.headerText(), QString("Warning"));
        QCOMPARE(buttonText(&note, "Btn"), QString("OK"));
        QSignalSpy pressed(&note, &NotificationPopup::btnClicked);
        press(&note, "Btn");
        QCOMPARE(pressed.count(), 1);
        QTRY_COMPARE(clicks(), 1);

        ErrorPopup error;
        QCOMPARE(error.objectName(), QString("ErrorPopup"));
        // The red icon, not the blue one.
        const QImage icon = error.findChild<QLabel*>("labelIcon")->pixmap(Qt::ReturnByValue).toImage();
        const QColor centreRing = icon.pixelColor(32, 4);
        QVERIFY(centreRing.red() > 200 && centreRing.blue() < 120);
    }

    void deletePopupAsksWithItsDefaults()
    {
        DeletePopup popup;
        QCOMPARE(labelText(&popup, "labelHeader"), QString("Delete All Samples?"));
        QCOMPARE(buttonText(&popup, "BtnConfirm"), QString("Delete"));
        QCOMPARE(buttonText(&popup, "BtnCancel"), QString("No"));
        popup.setHeaderText("Delete Job?");
        popup.setMessageText("The entire job and all samples will be permanently deleted.");
        popup.setConfirmButtonText("Exit");
        popup.setCancelButtonText("Continue");
        QCOMPARE(labelText(&popup, "labelHeader"), QString("Delete Job?"));
        QCOMPARE(buttonText(&popup, "BtnCancel"), QString("Continue"));

        QSignalSpy confirmed(&popup, &DeletePopup::confirmClicked);
        QSignalSpy cancelled(&popup, &DeletePopup::cancelClicked);
        press(&popup, "BtnConfirm");
        press(&popup, "BtnCancel");
        QCOMPARE(confirmed.count(), 1);
        QCOMPARE(confirmed.at(0).at(0).value<PopupPanel*>(), static_cast<PopupPanel*>(&popup));
        QCOMPARE(cancelled.count(), 1);
        QTRY_COMPARE(clicks(), 2);
    }

    void overridePopupConfirmsOrCloses()
    {
        OverridePopup popup;
        popup.setTitleText("Warning");
        popup.setBodyText("This job was not created on the instrument. Are you sure you want to edit the job?");
        popup.setConfirmButtonText("Edit");
        popup.setCancelButtonText("Cancel");
        QCOMPARE(buttonText(&popup, "BtnMeasure"), QString("Edit"));
        QSignalSpy confirmed(&popup, &OverridePopup::confirmClicked);
        QSignalSpy closed(&popup, &PopupPanel::closePopup);
        press(&popup, "BtnMeasure");
        press(&popup, "BtnCancel");
        QCOMPARE(confirmed.count(), 1);
        QCOMPARE(closed.count(), 1);
        QTRY_COMPARE(clicks(), 2);
    }

    void terminateJobPopupIsSilent()
    {
        TerminateJobPopup popup;
        QCOMPARE(buttonText(&popup, "BtnStoreAverage"), QString("Store Average"));
        QCOMPARE(buttonText(&popup, "BtnRestartJob"), QString("Restart Job"));
        QCOMPARE(buttonText(&popup, "BtnCancel"), QString("Cancel"));
        QSignalSpy average(&popup, &TerminateJobPopup::averageJob);
        QSignalSpy restart(&popup, &TerminateJobPopup::restartJob);
        QSignalSpy closed(&popup, &PopupPanel::closePopup);
        press(&popup, "BtnStoreAverage");
        press(&popup, "BtnRestartJob");
        press(&popup, "BtnCancel");
        QCOMPARE(average.count(), 1);
        QCOMPARE(restart.count(), 1);
        QCOMPARE(closed.count(), 1);
        settleSounds();
        QCOMPARE(clicks(), 0);
    }

    void powerDownPopupOffersItsThreeChoices()
    {
        PowerDownPopup popup;
        QCOMPARE(buttonText(&popup, "BtnPowerOff"), QString("Power Off"));
        QCOMPARE(buttonText(&popup, "BtnReboot"), QString("Reboot"));
        QSignalSpy closed(&popup, &PopupPanel::closePopup);
        press(&popup, "BtnCancel");
        QCOMPARE(closed.count(), 1);
    }

    void undoPopupRaisesUndoAndBack()
    {
        UndoPopup popup;
        popup.setPopupText("Sample deleted");
        QCOMPARE(labelText(&popup, "labelText"), QString("Sample deleted"));
        QCOMPARE(buttonText(&popup, "BtnUndo"), QString("Undo"));
        QSignalSpy undo(&popup, &UndoPopup::undo);
        QSignalSpy back(&popup, &UndoPopup::back);
        press(&popup, "BtnUndo");
        press(&popup, "BtnBack");
        QCOMPARE(undo.count(), 1);
        QCOMPARE(back.count(), 1);
    }

    void theHiddenCornerClosesAPopupAndGoesHome()
    {
        NotificationPopup popup;
        popup.show();
        QVERIFY(QTest::qWaitForWindowExposed(&popup));
        QSignalSpy closed(&popup, &PopupPanel::closePopup);
        QSignalSpy home(API_SignalMaster::instance(), &API_SignalMaster::GoHome);
        // The corner button stands above the popup's own parts.
        QCOMPARE(popup.childAt(1, 1), static_cast<QWidget*>(popup.debugButton()));
        QTest::mouseClick(popup.debugButton(), Qt::LeftButton, {}, QPoint(1, 1));
        QCOMPARE(closed.count(), 1);
        QCOMPARE(home.count(), 1);
    }


    void coversSayWhatTheyAreWaitingFor()
    {
        LockScreen lock;
        QCOMPARE(lock.objectName(), QString("LockScreen"));
        QCOMPARE(lock.title(), QString("Instrument Locked"));
        QVERIFY(!lock.hasTimeLimit());

        LockScreen limited(200, nullptr);
        QSignalSpy closed(&limited, &DaddyPanel::CloseScreenSignal);
        QTRY_COMPARE(closed.count(), 1);
        QVERIFY(limited.isClosing());

        SyncScreen sync;
        QCOMPARE(sync.title(), QString("Syncing Job Data"));
        QVERIFY(sync.hasTimeLimit());
        QSignalSpy syncClosed(&sync, &DaddyPanel::CloseScreenSignal);
        QTest::qWait(SyncScreen::DefaultTimeLimitMs - 300);
        QCOMPARE(syncClosed.count(), 0);
        QTRY_COMPARE_WITH_TIMEOUT(syncClosed.count(), 1, 1500);
    }

    void defaultTextsFollowTheLanguage()
    {
        LockScreen lock;
        SyncScreen sync;
        LockScreen calibrating;
        calibrating.setTitle(QStringLiteral("Calibrating"));
        DeletePopup ask;
        DeletePopup custom;
        custom.setHeaderText(QStringLiteral("Delete Job?"));
        QVERIFY(lock.findChild<SpinnyCircle*>()); // one spinner for every cover

        QTranslator german;
        QVERIFY(german.load(ScreenMaster::languageFilePath("de")));
        QCoreApplication::installTranslator(&german);
        QCoreApplication::processEvents(); // the change reaches windows as a posted event
        QCOMPARE(lock.title(), QString("Gerät gesperrt"));
        QCOMPARE(sync.title(), QString("Auftragsdaten werden synchronisiert"));
        QCOMPARE(calibrating.title(), QString("Calibrating")); // the owner's text stays
        QCOMPARE(labelText(&ask, "labelHeader"), QString("Alle Proben löschen?"));
        QCOMPARE(buttonText(&ask, "BtnCancel"), QString("Nein"));
        QCOMPARE(labelText(&custom, "labelHeader"), QString("Delete Job?"));
        QCoreApplication::removeTranslator(&german);
        QCoreApplication::processEvents();
        QCOMPARE(lock.title(), QString("Instrument Locked"));
    }

    void aCoverDeletedBeforeItsQueuedCloseIsNotTouched()
    {
        // The sync cover's time limit queues its close; the owner may delete
        // it first (the rebuild it covered has ended). The queued request then
        // carries a dangling pointer, which must only be compared, never used.
        QWidget display;
        auto* panel = new DaddyPanel(&display);
        panel->onShowSyncScreen();
        auto* cover = display.findChild<SyncScreen*>();
        QVERIFY(cover);
        cover->CloseScreen();
        panel->onCloseSyncScreen();
        QVERIFY(!display.findChild<SyncScreen*>());
        QCoreApplication::processEvents();
        // A newer cover in the same place is not closed by the old request.
        panel->onShowSyncScreen();
        QPointer<SyncScreen> newer = display.findChild<SyncScreen*>();
        QCoreApplication::processEvents();
        QVERIFY(newer);
    }

    void theFaultScreenAnnouncesItself()
    {
        QSignalSpy jobUpdate(API_SignalMaster::instance(), &API_SignalMaster::JobUpdate);
        SadPuppyScreen fault;
        QCOMPARE(jobUpdate.count(), 1);
        QCOMPARE(labelText(&fault, "labelTextTitle"), QString("Error"));
        QCOMPARE(labelText(&fault, "labelTextSummary"),
                 QString("An error has occurred, please reboot the instrument"));
        QCOMPARE(buttonText(&fault, "Btn"), QString("OK"));
        // The panel's apocalypse helper plays the user error sound.
        QTRY_VERIFY(Platform::recordedCommands().contains(played("errorUser.wav")));
        QVERIFY(!Platform::recordedCommands().contains(played("errorApocalypse.wav")));

        QSignalSpy home(&fault, &DaddyPanel::GotoHomeScreenSignal);
        press(&fault, "Btn");
        QCOMPARE(home.count(), 1);
        QTRY_COMPARE(clicks(), 1);
    }
};

QTEST_MAIN(TestPopups)
#include "tst_popups.moc"
