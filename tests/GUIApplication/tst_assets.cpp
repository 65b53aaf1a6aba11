// Every picture the forms and the code name by its resource path exists in
// the built resources: a missing one shows as an empty label or an
// invisible button, with no error anywhere.

#include <QDirIterator>
#include <QFile>
#include <QRegularExpression>
#include <QtTest>

class TestAssets : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase()
    {
        // Nothing else here calls into the library that holds the resources.
        Q_INIT_RESOURCE(marigold);
    }

    void everyNamedPictureExists()
    {
        static const QRegularExpression name(":/(Assets|Keyboard)/[A-Za-z0-9_]+\\.png");
        QStringList missing;
        int seen = 0;
        QDirIterator it(QStringLiteral(MARIGOLD_APP_DIR), {"*.ui", "*.cpp", "*.h"}, QDir::Files,
                        QDirIterator::Subdirectories);
        while (it.hasNext()) {
            const QString path = it.next();
            QFile file(path);
            QVERIFY(file.open(QIODevice::ReadOnly));
            const QString text = QString::fromUtf8(file.readAll());
            auto match = name.globalMatch(text);
            while (match.hasNext()) {
                const QString resource = match.next().captured();
                ++seen;
                if (!QFile::exists(resource))
                    missing << QString("%1 (in %2)").arg(resource, QFileInfo(path).fileName());
            }
        }
        QVERIFY(seen > 50);
        missing.removeDuplicates();
        QVERIFY2(missing.isEmpty(), qPrintable(missing.join('\n')));
    }
};

QTEST_GUILESS_MAIN(TestAssets)
#include "tst_assets.moc"
