#include "Widgets/SettingsFileViewerPage.h"

#include "Widgets/FlickList.h"
#include "Widgets/QsKineticScroller.h"
#include "Widgets/Theme.h"

#include <QFile>
#include <QFileInfo>
#include <QImageReader>
#include <QLabel>
#include <QPlainTextEdit>
#include <QRegularExpression>
#include <QScrollArea>
#include <QScrollBar>
#include <QTextStream>

namespace {
// Licence texts can be long; more than this is not read into the viewer.
const qint64 kMaxTextBytes = 2 * 1024 * 1024;
} // namespace

QString SettingsFileViewerPage::reflow(const QString& text)
{
    // Licence files are broken at 70 to 80 columns for a terminal; on a
    // screen of 320 pixels those breaks leave ragged half lines. Lines of a
    // paragraph are joined and the view wraps them itself.
    QStringList paragraphs;
    const QStringList blocks = text.split(QRegularExpression(QStringLiteral("\\n[ \\t]*\\n")));
    for (const QString& block : blocks) {
        QStringList lines;
        for (const QString& line : block.split('\n')) {
            const QString trimmed = line.trimmed();
            if (!trimmed.isEmpty())
                lines << trimmed;
        }
        if (!lines.isEmpty())
            paragraphs << lines.join(QLatin1Char(' '));
    }
    return paragraphs.join(QStringLiteral("\n\n"));
}

bool SettingsFileViewerPage::isPictureFile(const QString& path)
{
    const QString suffix = QFileInfo(path).suffix().toLower();
    return suffix == "png" || suffix == "jpg" || suffix == "jpeg" || suffix == "bmp";
}

SettingsFileViewerPage::SettingsFileViewerPage(const QString& path, const QString& title, QWidget* parent)
    : SettingsPage(title, parent)
    , m_path(path)
    , m_picture(isPictureFile(path))
{
    FlickList* list = getSettingsList();
    list->hide();
    m_scroller = new QsKineticScroller(this);
    if (m_picture) {
        m_area = new QScrollArea(this);
        m_area->setGeometry(list->geometry());
        m_area->setFrameShape(QFrame::NoFrame);
        m_area->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
        m_area->verticalScrollBar()->setStyleSheet(FlickList::verticalScrollBarStyle());
        m_area->setStyleSheet(QStringLiteral("QScrollArea { background: white; }"));
        auto* picture = new QLabel;
        picture->setObjectName(QStringLiteral("labelPicture"));
        picture->setAlignment(Qt::AlignHCenter | Qt::AlignTop);
        picture->setStyleSheet(QStringLiteral("background: white;"));
        QImageReader reader(path);
        const QImage image = reader.read();
        if (image.isNull()) {
            picture->setText(tr("The file can't be shown."));
        } else {
            const int width = Theme::ScreenWidth - 24;
            picture->setPixmap(QPixmap::fromImage(
                image.width() > width ? image.scaledToWidth(width, Qt::SmoothTransformation) : image));
        }
        picture->setMargin(12);
        m_area->setWidget(picture);
        m_area->setWidgetResizable(true);
        m_scroller->enableKineticScrollFor(m_area);
    } else {
        m_text = new QPlainTextEdit(this);
        m_text->setObjectName(QStringLiteral("textFile"));
        m_text->setGeometry(list->geometry());
        m_text->setReadOnly(true);
        m_text->setTextInteractionFlags(Qt::NoTextInteraction);
        m_text->setFrameShape(QFrame::NoFrame);
        m_text->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
        m_text->verticalScrollBar()->setStyleSheet(FlickList::verticalScrollBarStyle());
        m_text->setFont(Theme::font(Theme::FontSmall));
        m_text->setStyleSheet(QStringLiteral("QPlainTextEdit { background: white; color: %1; padding: 6px; }")
                                  .arg(Theme::css(Theme::TextBody)));
        QFile file(path);
        QString content;
        if (file.open(QIODevice::ReadOnly)) {
            content = QString::fromUtf8(file.read(kMaxTextBytes));
            if (!file.atEnd())
                content += QStringLiteral("\n[...]");
        } else {
            content = tr("The file can't be read.");
        }
        m_text->setPlainText(reflow(content));
        m_scroller->enableKineticScrollFor(m_text);
    }
}

QString SettingsFileViewerPage::text() const
{
    return m_text ? m_text->toPlainText() : QString();
}

void SettingsFileViewerPage::resizeEvent(QResizeEvent* event)
{
    SettingsPage::resizeEvent(event);
    const QRect area = getSettingsList()->geometry();
    if (m_text)
        m_text->setGeometry(area);
    if (m_area)
        m_area->setGeometry(area);
}
