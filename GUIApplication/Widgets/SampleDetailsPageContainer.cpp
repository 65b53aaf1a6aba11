#include "Widgets/SampleDetailsPageContainer.h"

#include "GUIAPI/DataManager.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/Sample.h"
#include "SharedSystem/StringTables.h"
#include "Widgets/ColorPatch.h"
#include "Widgets/FlickButton.h"
#include "Widgets/SampleDetailsPage.h"
#include "Widgets/SampleTexturePage.h"
#include "Widgets/Theme.h"

#include <QEvent>
#include <QSignalMapper>
#include <QStyle>

namespace {

const int kMaxButtonHeight = 58;
const int kPatchWidth = 34;

QString buttonStyle()
{
    return QStringLiteral(
               "QPushButton { text-align: left; padding-left: 6px; border: none;"
               " border-bottom: 1px solid %1; background-color: %2; color: %3; }"
               "QPushButton[selected=\"true\"] { background-color: %4; color: %5; font-weight: bold; }"
               "QPushButton:pressed { background-color: %6; }")
        .arg(Theme::css(Theme::Separator), Theme::css(Theme::GroundLight), Theme::css(Theme::TextBody),
             Theme::css(Theme::GroundPanel), Theme::css(Theme::Accent), Theme::css(Theme::AccentTint));
}

} // namespace

// ---- SampleDetailsPageContainer ---------------------------------------------------

SampleDetailsPageContainer::SampleDetailsPageContainer(QWidget* parent)
    : VerticalPageContainer(parent)
    , m_buttonWidth(ButtonWidth)
    , m_signalMapper(new QSignalMapper(this))
{
    // The vertical snap measures from the container's own top, so the
    // container stands at the top of the box it is given.
    if (parent)
        setGeometry(parent->rect());
    connect(m_signalMapper, &QSignalMapper::mappedInt, this,
            &SampleDetailsPageContainer::onSelectPageWithSlide);
}

SampleDetailsPageContainer::~SampleDetailsPageContainer() = default;

int SampleDetailsPageContainer::buttonHeight() const
{
    const int n = qMax(1, m_buttonStrings.size());
    return qMin(kMaxButtonHeight, height() / n);
}

void SampleDetailsPageContainer::fitPage(QWidget* page)
{
    page->setGeometry(m_buttonWidth, 0, width() - m_buttonWidth, height());
}

void SampleDetailsPageContainer::appendPage(QWidget* page)
{
    fitPage(page);
    VerticalPageContainer::appendPage(page);
    drawButtons();
}

void SampleDetailsPageContainer::drawButtons()
{
    removeAllButtons();
    const int h = buttonHeight();
    for (int i = 0; i < m_buttonStrings.size(); ++i) {
        auto* button = new FlickButton(this);
        button->setObjectName(QStringLiteral("pageButton%1").arg(i));
        button->setText(m_buttonStrings[i]);
        button->setFont(Theme::font(Theme::FontButton));
        button->setStyleSheet(buttonStyle());
        button->setFocusPolicy(Qt::NoFocus);
        button->setGeometry(0, i * h, m_buttonWidth, h);
        button->setProperty("selected", i == m_currentPage);
        connect(button, &QPushButton::clicked, m_signalMapper, qOverload<>(&QSignalMapper::map));
        m_signalMapper->setMapping(button, i);
        button->raise();
        button->show();
        m_pageButtons.push_back(button);
    }
}

void SampleDetailsPageContainer::removeAllButtons()
{
    for (FlickButton* button : m_pageButtons)
        delete button;
    m_pageButtons.clear();
}

void SampleDetailsPageContainer::removeButton(int index)
{
    if (index < 0 || index >= int(m_pageButtons.size()))
        return;
    delete m_pageButtons[size_t(index)];
    m_pageButtons.erase(m_pageButtons.begin() + index);
}

void SampleDetailsPageContainer::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange) {
        // Angle names such as "Diffuse" come from the string tables, which
        // the language change has already reread.
        m_buttonStrings = translatedButtonStrings();
        for (size_t i = 0; i < m_pageButtons.size() && int(i) < m_buttonStrings.size(); ++i)
            m_pageButtons[i]->setText(m_buttonStrings.at(int(i)).trimmed());
    }
    VerticalPageContainer::changeEvent(event);
}

void SampleDetailsPageContainer::onSelectPageWithSlide(int index)
{
    if (index < 0 || index >= getNumberOfPages())
        return;
    playSoundButtonClick();
    onSelectPage(index);
}

void SampleDetailsPageContainer::updatePage()
{
    VerticalPageContainer::updatePage();
    for (size_t i = 0; i < m_pageButtons.size(); ++i) {
        FlickButton* button = m_pageButtons[i];
        const bool selected = int(i) == m_currentPage;
        if (button->property("selected").toBool() == selected)
            continue;
        button->setProperty("selected", selected);
        button->style()->unpolish(button);
        button->style()->polish(button);
    }
}

// ---- colour figures ---------------------------------------------------------------

SampleDetailsPageContainerDNumber::SampleDetailsPageContainerDNumber(QWidget* parent)
    : SampleDetailsPageContainer(parent)
{
}

void SampleDetailsPageContainerDNumber::appendPage(REFL_ANGLE_T angle)
{
    const Sample sample = DataManager::instance()->getActiveSampleObject();
    const LABCH_T labch = sample.getLabch(angle);
    auto* page = new SampleDetailsPage(this);
    page->setObjectName(QStringLiteral("detailsPage%1").arg(int(angle)));
    page->set_L_Star(labch.l);
    page->set_a_Star(labch.a);
    page->set_b_Star(labch.b);
    page->set_C_Star(labch.c);
    page->set_h_Star(labch.h);
    m_buttonAngles.push_back(angle);
    m_buttonStrings.append(buttonString(angle));
    SampleDetailsPageContainer::appendPage(page);
}

QString SampleDetailsPageContainerDNumber::buttonString(REFL_ANGLE_T angle)
{
    // The blanks leave room for the colour patch on the button.
    return QStringLiteral("          %1").arg(getStringFromList(angle, ANGLE_TABLE));
}

QStringList SampleDetailsPageContainerDNumber::translatedButtonStrings() const
{
    QStringList strings;
    for (REFL_ANGLE_T angle : m_buttonAngles)
        strings << buttonString(angle);
    return strings;
}

void SampleDetailsPageContainerDNumber::drawButtons()
{
    removeAllColorPatches();
    SampleDetailsPageContainer::drawButtons();
    const Sample sample = DataManager::instance()->getActiveSampleObject();
    for (size_t i = 0; i < m_pageButtons.size() && i < m_buttonAngles.size(); ++i) {
        // The blanks make room for the patch only in a font with narrow
        // spaces; a padding of the patch's width does it in every language.
        FlickButton* button = m_pageButtons[i];
        button->setText(m_buttonStrings.at(int(i)).trimmed());
        button->setStyleSheet(button->styleSheet()
                              + QStringLiteral("QPushButton { padding-left: %1px; }").arg(kPatchWidth + 10));
        const QRect b = button->geometry();
        auto* patch = new ColorPatch(this);
        patch->setObjectName(QStringLiteral("buttonPatch%1").arg(i));
        patch->setColor(sample.getColor(m_buttonAngles[i]));
        // Clicks go through to the button under the patch.
        patch->setAttribute(Qt::WA_TransparentForMouseEvents);
        patch->setGeometry(b.left(), b.top(), kPatchWidth, b.height() - 1);
        patch->raise();
        patch->show();
        m_colorPatches.push_back(patch);
    }
}

void SampleDetailsPageContainerDNumber::removeAllButtons()
{
    removeAllColorPatches();
    SampleDetailsPageContainer::removeAllButtons();
}

void SampleDetailsPageContainerDNumber::removeAllColorPatches()
{
    for (ColorPatch* patch : m_colorPatches)
        delete patch;
    m_colorPatches.clear();
}

void SampleDetailsPageContainerDNumber::updatePage()
{
    SampleDetailsPageContainer::updatePage();
    // A restyled button must not cover its patch.
    for (ColorPatch* patch : m_colorPatches)
        patch->raise();
}

SampleDetailsPageContainerD45::SampleDetailsPageContainerD45(QWidget* parent)
    : SampleDetailsPageContainerDNumber(parent)
{
    for (int angle = REFL_D45_NEG_15; angle <= REFL_D45_110; ++angle)
        appendPage(static_cast<REFL_ANGLE_T>(angle));
}

SampleDetailsPageContainerD15::SampleDetailsPageContainerD15(QWidget* parent)
    : SampleDetailsPageContainerDNumber(parent)
{
    for (int angle = REFL_D15_NEG_45; angle <= REFL_D15_80; ++angle)
        appendPage(static_cast<REFL_ANGLE_T>(angle));
}

// ---- texture figures --------------------------------------------------------------

SampleDetailsPageContainerTexture::SampleDetailsPageContainerTexture(QWidget* parent)
    : SampleDetailsPageContainer(parent)
{
    for (int angle = IMAGE_NEG_45; angle <= IMAGE_80; ++angle)
        appendPage(static_cast<IMAGE_ANGLE_T>(angle));
    if (Instrument_Get_Num_Camera_Images() >= 6)
        appendPage(IMAGE_DIFFUSE);
}

void SampleDetailsPageContainerTexture::appendPage(IMAGE_ANGLE_T angle)
{
    auto* page = new SampleTexturePage(angle, this);
    page->setObjectName(QStringLiteral("texturePage%1").arg(int(angle)));
    m_imageAngles.push_back(angle);
    m_buttonStrings.append(getStringFromList(angle, IMAGE_ANGLE_TABLE));
    SampleDetailsPageContainer::appendPage(page);
}

QStringList SampleDetailsPageContainerTexture::translatedButtonStrings() const
{
    QStringList strings;
    for (IMAGE_ANGLE_T angle : m_imageAngles)
        strings << getStringFromList(angle, IMAGE_ANGLE_TABLE);
    return strings;
}
