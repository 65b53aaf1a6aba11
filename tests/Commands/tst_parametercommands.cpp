// The parameter store: each key's content type decides its encoding both
// ways, with the two required asymmetries.

#include "Commands/ParametersOutCommands.h"
#include "Communication/CmdData.h"
#include "Communication/Commands.h"
#include "Communication/TcpClient.h"
#include "support/ScriptedPeer.h"

#include <QTextCodec>
#include <QtTest>

#include <cstring>
#include <memory>

namespace {

const int ALL_KEYS[] = {0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15, 16, 17, 18, 19, 20, 23, 24, 25,
                        26, 27, 28, 31, 32, 33, 34, 35, 36, 37, 39, 41, 43, 45, 46, 47, 48, 1000, 1001, 1002,
                        1013, 1050, 1060, 3000, 3100, 65516};

enum Kind { Text, Wide, List, Float, Int };

Kind kindOf(int key)
{
    switch (key) {
    case PARAMETER_NUMBER_FORMAT: case PARAMETER_DATE_FORMAT: case PARAMETER_TIME_FORMAT:
    case PARAMETER_CURRENT_LANGUAGE_ID: case PARAMETER_MEASURING_CIRCLE_ID: case PARAMETER_MEASUREMENT_MODE:
    case PARAMETER_ONLINE_MODE_JOB: case PARAMETER_WEBSERVER_ADDRESS: case PARAMETER_SYNC_JOB_TO_WEBSERVER:
        return Text;
    case PARAMETER_DEFAULT_JOB_NAME: case PARAMETER_TEXT_MESSAGE:
        return Wide;
    case PARAMETER_DISPLAYED_CHANNELS: case PARAMETER_DISPLAYED_IMAGE_CHANNELS:
    case PARAMETER_DISPLAYED_SPECTRAL_CHANNELS:
        return List;
    case PARAMETER_SAMPLE_TEMP_LIMIT_LOW: case PARAMETER_SAMPLE_TEMP_LIMIT_HIGH: case PARAMETER_AUTO_MEASURE_TIMEOUT:
        return Float;
    default:
        return Int;
    }
}

// The value encoded as the wire wants it for this kind, written by hand.
QByteArray encoded(Kind kind, const PARAMETER_CONTENT_TYPES& v)
{
    QByteArray out;
    auto le32 = [&out](quint32 x) {
        for (int i = 0; i < 4; ++i)
            out.append(char((x >> (8 * i)) & 0xFF));
    };
    switch (kind) {
    case Text:
        le32(quint32(v.parameterString.size()));
        out += v.parameterString.toUtf8();
        break;
    case Wide:
        le32(quint32(v.parameterString.size()));
        for (QChar c : v.parameterString)
            le32(c.unicode());
        break;
    case List:
        le32(quint32(v.paramterStringList.size()));
        for (const QString& s : v.paramterStringList) {
            le32(quint32(s.size()));
            out += s.toUtf8();
        }
        break;
    case Float: {
        quint32 bits;
        std::memcpy(&bits, &v.parameterFloat, 4);
        le32(bits);
        break;
    }
    case Int:
        le32(quint32(v.parameterInt));
        break;
    }
    return out;
}

QByteArray key16(int key)
{
    return QByteArray(1, char(key & 0xFF)) + QByteArray(1, char((key >> 8) & 0xFF));
}

PARAMETER_CONTENT_TYPES sentinel()
{
    PARAMETER_CONTENT_TYPES v;
    v.parameterInt = 111;
    v.parameterString = "untouched";
    v.paramterStringList = QStringList{"untouched"};
    v.parameterFloat = 1.25f;
    return v;
}

PARAMETER_CONTENT_TYPES sample()
{
    PARAMETER_CONTENT_TYPES v;
    v.parameterInt = -70000;
    v.parameterString = "dd.MM.yyyy";
    v.paramterStringList = QStringList{"D65_10", "", "A_2"};
    v.parameterFloat = 37.5f;
    return v;
}

} // namespace

class TestParameterCommands : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<ScriptedPeer> m_peer;

    CmdData lastRequest() const
    {
        return CmdData(m_peer->receivedFrames().value(m_peer->receivedFrames().size() - 1));
    }

private slots:
    void initTestCase()
    {
        QTextCodec::setCodecForLocale(QTextCodec::codecForName("utf8"));
        m_peer.reset(new ScriptedPeer);
        QVERIFY(m_peer->listen());
        QVERIFY(m_peer->attachCommands());
    }

    void cleanupTestCase()
    {
        delete Commands::instance()->tcpClient();
    }

    void everyKeyTravelsByItsContentType_data()
    {
        QTest::addColumn<int>("key");
        for (int key : ALL_KEYS)
            QTest::newRow(qPrintable(QString::number(key))) << key;
    }

    void everyKeyTravelsByItsContentType()
    {
        QFETCH(int, key);
        const Kind kind = kindOf(key);
        const PARAMETER_CONTENT_TYPES value = sample();

        // Writing.
        m_peer->answerAll(0);
        QCOMPARE(CmdOut_SetParameter(PARAMETER_TYPE_T(key), value), STATUS_OK);
        QCOMPARE(lastRequest().getCommandCode(), 0x400A0E10L);
        const QByteArray expectedValue = key == PARAMETER_WEBSERVER_ADDRESS ? QByteArray() : encoded(kind, value);
        QCOMPARE(lastRequest().getBuffer(), key16(key) + expectedValue);

        // Reading fills the member of the type and leaves the others.
        m_peer->answerAll(0, key16(key) + encoded(kind, value));
        PARAMETER_CONTENT_TYPES got = sentinel();
        QCOMPARE(CmdOut_GetParameter(PARAMETER_TYPE_T(key), got), STATUS_OK);
        QCOMPARE(lastRequest().getCommandCode(), 0x400A0E00L);
        QCOMPARE(lastRequest().getBuffer(), key16(key));
        const PARAMETER_CONTENT_TYPES untouched = sentinel();
        QCOMPARE(got.parameterInt, kind == Int ? value.parameterInt : untouched.parameterInt);
        QCOMPARE(got.parameterString, (kind == Text || kind == Wide) ? value.parameterString : untouched.parameterString);
        QCOMPARE(got.paramterStringList, kind == List ? value.paramterStringList : untouched.paramterStringList);
        QCOMPARE(got.parameterFloat, kind == Float ? value.parameterFloat : untouched.parameterFloat);
    }

    void keyOutsideTheTableCarriesNoValue()
    {
        m_peer->answerAll(0, key16(21) + QByteArray("\x05\0\0\0", 4));
        PARAMETER_CONTENT_TYPES got = sentinel();
        QCOMPARE(CmdOut_GetParameter(PARAMETER_TYPE_T(21), got), STATUS_OK);
        QCOMPARE(got.parameterInt, 111);
        QCOMPARE(got.parameterString, QString("untouched"));

        m_peer->answerAll(0);
        QCOMPARE(CmdOut_SetParameter(PARAMETER_TYPE_T(21), sample()), STATUS_OK);
        QCOMPARE(lastRequest().getBuffer(), key16(21));
    }

    void wideTextSurvivesInJapanese()
    {
        PARAMETER_CONTENT_TYPES name;
        name.parameterString = QString::fromUtf8("塗装ジョブ");
        m_peer->answerAll(0);
        QCOMPARE(CmdOut_SetParameter(PARAMETER_DEFAULT_JOB_NAME, name), STATUS_OK);
        const QByteArray sentValue = lastRequest().getBuffer().mid(2);
        QCOMPARE(sentValue.size(), 4 + 4 * 5);

        // Sent back as it went out, it reads as the same text.
        m_peer->answerAll(0, key16(PARAMETER_DEFAULT_JOB_NAME) + sentValue);
        PARAMETER_CONTENT_TYPES got;
        QCOMPARE(CmdOut_GetParameter(PARAMETER_DEFAULT_JOB_NAME, got), STATUS_OK);
        QCOMPARE(got.parameterString, name.parameterString);
    }

    void failuresComeBackAsTheResult()
    {
        m_peer->answerAll(0, key16(PARAMETER_DISPLAYED_CHANNELS) + QByteArray("\x02\0\0\0\x01\0\0\0x", 9));
        PARAMETER_CONTENT_TYPES got = sentinel();
        QCOMPARE(CmdOut_GetParameter(PARAMETER_DISPLAYED_CHANNELS, got), STATUS_BAD_RESPONSE);
        QCOMPARE(got.paramterStringList, QStringList{"untouched"});

        m_peer->answerAll(1065);
        QCOMPARE(CmdOut_SetParameter(PARAMETER_AUTO_MEASURE, sample()), STATUS_BAD_RESPONSE_STATUS);
        QCOMPARE(CmdOut_SetParametersToDefaults(), STATUS_BAD_RESPONSE_STATUS);
        QCOMPARE(lastRequest().getCommandCode(), 0x400A1020L);
    }

    void languagesAreTag32AndReplaceTheList()
    {
        CmdData p;
        p.append_si32(2);
        p.appendTag32(TAG_ITEM_T{"en", "English"});
        p.appendTag32(TAG_ITEM_T{"ja", QString::fromUtf8("日本語")});
        m_peer->answerAll(0, p.getBuffer());
        QVector<TAG_ITEM_T> languages(4);
        QCOMPARE(CmdOut_GetLanguages(languages), STATUS_OK);
        QCOMPARE(languages.size(), 2);
        QCOMPARE(languages[1].tagID, QString("ja"));
        QCOMPARE(languages[1].tagText, QString::fromUtf8("日本語"));
        QCOMPARE(lastRequest().getCommandCode(), 0x400A0900L);
    }
};

QTEST_GUILESS_MAIN(TestParameterCommands)
#include "tst_parametercommands.moc"
