#ifndef SCREENMASTER_H
#define SCREENMASTER_H

#include "SharedSystem/InstrumentTypes.h"

#include <QMainWindow>

#include <functional>

class QStackedLayout;
class QTranslator;

namespace Ui {
struct ScreenMaster
{
    QWidget* centralwidget = nullptr;
    void setupUi(QMainWindow* window);
};
} // namespace Ui

// The one top-level window and the owner of the stack of full-screen panels.
// Screens never create each other: they ask by SCREEN_ID_T and ScreenMaster
// builds, stacks, activates and closes them. The home screen lies at the
// bottom for the whole run and is never closed.
class ScreenMaster : public QMainWindow
{
    Q_OBJECT
public:
    // Builds a screen for an id, or returns null for an id it does not know.
    // Used instead of the built-in factory where it returns a screen: tests
    // and the screenshot tour stand in for screens of other parts with it.
    using ScreenFactory = std::function<QWidget*(SCREEN_ID_T id, QWidget* parent)>;
    static void setScreenFactoryOverride(ScreenFactory factory);

    static QString languageFilePath(const QString& code);

    explicit ScreenMaster(QWidget* parent = nullptr);
    ~ScreenMaster() override;

    QStackedLayout* screenStack() const { return m_ScreenStack; }
    int screenCount() const;
    QWidget* currentScreen() const;
    QWidget* screenAt(int index) const;

public slots:
    QWidget* onAddScreenToStack(SCREEN_ID_T id);
    void onCloseScreen(QWidget* screen);
    void onCloseCurrentScreen();
    void onRemoveAndAddScreenToStack(QWidget* screen, SCREEN_ID_T id);
    void onGotoHomeScreen();
    void onGotoSyncScreen();
    void onGotoLockScreen();
    void onCloseLockScreen();
    void onGotoLabMode();
    void onGotoWhiteCalibration();
    void onGotoRefCheck();
    void onGotoSadPuppy();
    void onDisplayCalibrationPopup();
    bool onLoadLanguage(const QString& code);
    bool onLoadLanguageFile(const QString& path);

private:
    void LaunchFirstScreen();
    QWidget* createScreen(SCREEN_ID_T id);
    void activateTop();
    void gotoCalibrationStep(SCREEN_ID_T id);
    // Adds the screen unless the current one is of that class.
    void addUnlessOnTop(const char* className, SCREEN_ID_T id);

    Ui::ScreenMaster* ui;
    QStackedLayout* m_ScreenStack = nullptr;
    QTranslator* m_pTranslator = nullptr;
};

#endif // SCREENMASTER_H
