// Date-times in the user's formats, for lists and for the status bar.
#include "SharedSystem/UserParams.h"
#include "Utils/ConversionHelper.h"

#include <QtTest>

class TestConversionHelper : public QObject
{
    Q_OBJECT

private slots:
    void init() { UserParams::setDefaults(); }

    void defaultFormats()
    {
        const QDateTime t(QDate(2020, 2, 1), QTime(14, 5, 9));
        QCOMPARE(convertDateTimeToString(t), QString("2:05:09 pm 02/01/20"));
        QCOMPARE(convertDateTimeToStatusBarString(t), QString("2:05pm"));
    }

    void userFormats()
    {
        const QDateTime t(QDate(2021, 12, 24), QTime(9, 7, 3));
        UserParams::setTimeFormat("HH:mm:ss");
        UserParams::setDateFormat("dd.MM.yyyy");
        QCOMPARE(convertDateTimeToString(t), QString("09:07:03 24.12.2021"));
        // Every ":ss" goes, then every blank.
        QCOMPARE(convertDateTimeToStatusBarString(t), QString("09:07"));
        UserParams::setTimeFormat("h : mm:ss:ss AP");
        QCOMPARE(convertDateTimeToStatusBarString(t), QString("9:07AM"));
    }
};

QTEST_MAIN(TestConversionHelper)
#include "tst_conversionhelper.moc"
