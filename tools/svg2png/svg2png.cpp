// Rasterises one SVG picture to PNG at the size the SVG declares, or at an
// explicit "WIDTHxHEIGHT" given as third argument. Used by the build so that
// the pictures live in the repository as editable SVG only.
#include <QGuiApplication>
#include <QImage>
#include <QPainter>
#include <QSvgRenderer>
#include <QTextStream>

int main(int argc, char** argv)
{
    QGuiApplication app(argc, argv);
    QTextStream err(stderr);
    if (argc < 3) {
        err << "usage: svg2png input.svg output.png [WIDTHxHEIGHT]\n";
        return 2;
    }
    QSvgRenderer renderer(QString::fromLocal8Bit(argv[1]));
    if (!renderer.isValid()) {
        err << "svg2png: cannot read " << argv[1] << "\n";
        return 1;
    }
    QSize size = renderer.defaultSize();
    if (argc > 3) {
        const QStringList wh = QString::fromLatin1(argv[3]).split('x');
        if (wh.size() == 2)
            size = QSize(wh[0].toInt(), wh[1].toInt());
    }
    if (size.isEmpty()) {
        err << "svg2png: " << argv[1] << " has no size\n";
        return 1;
    }
    QImage image(size, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setRenderHint(QPainter::SmoothPixmapTransform);
    renderer.render(&painter);
    painter.end();
    if (!image.save(QString::fromLocal8Bit(argv[2]), "PNG")) {
        err << "svg2png: cannot write " << argv[2] << "\n";
        return 1;
    }
    return 0;
}
