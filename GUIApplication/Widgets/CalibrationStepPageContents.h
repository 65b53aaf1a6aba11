#ifndef CALIBRATIONSTEPPAGECONTENTS_H
#define CALIBRATIONSTEPPAGECONTENTS_H

#include <QWidget>

#include <functional>

namespace Ui {
class CalibrationStep1PageContents;
class CalibrationStep2PageContents;
class CalibrationStep3PageContents;
}

// The contents of the instruction steps. A text given by the owner is kept
// as a function so that it follows a change of language.
using StepText = std::function<QString()>;

// Step 1: which tile (or the open air) and its picture.
class CalibrationStep1PageContents : public QWidget
{
    Q_OBJECT
public:
    explicit CalibrationStep1PageContents(QWidget* parent = nullptr);
    ~CalibrationStep1PageContents() override;

    void setDescriptionText(StepText text);
    void setBackgroundToReference();
    void setBackgroundToWhite();
    void setBackgroundToLifted();
    QString descriptionText() const;
    QString backgroundResource() const { return m_background; }

protected:
    void changeEvent(QEvent* event) override;

private:
    void setBackground(const QString& resource);
    Ui::CalibrationStep1PageContents* ui;
    StepText m_text;
    QString m_background;
};

// Step 2: placing the instrument on the tile.
class CalibrationStep2PageContents : public QWidget
{
    Q_OBJECT
public:
    explicit CalibrationStep2PageContents(QWidget* parent = nullptr);
    ~CalibrationStep2PageContents() override;

    void setDescriptionText(StepText text);
    QString descriptionText() const;

protected:
    void changeEvent(QEvent* event) override;

private:
    Ui::CalibrationStep2PageContents* ui;
    StepText m_text;
};

// Step 3: how to start, by the button or by the instrument's key.
class CalibrationStep3PageContents : public QWidget
{
    Q_OBJECT
public:
    explicit CalibrationStep3PageContents(QWidget* parent = nullptr);
    ~CalibrationStep3PageContents() override;

    void setTopAreaText(StepText text);
    void setBottomAreaText(StepText text);
    void setButtonText(StepText text);
    QString topAreaText() const;
    QString bottomAreaText() const;
    QWidget* calibrateButton() const;

signals:
    void calibrationClicked();

protected:
    void changeEvent(QEvent* event) override;

private:
    void retranslate();
    Ui::CalibrationStep3PageContents* ui;
    StepText m_top;
    StepText m_bottom;
    StepText m_button;
};

#endif // CALIBRATIONSTEPPAGECONTENTS_H
