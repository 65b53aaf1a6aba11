// One measurement: the guards on angles, the staged pictures and the shared
// lock.
#include "SharedSystem/Instrument.h"
#include "SharedSystem/Sample.h"
#include "SharedSystem/UserParams.h"

#include <QtTest>

#include <thread>

namespace {

// A wire picture whose pixel at x, y is (x, y, 7).
QByteArray positionCoded(int width, int height)
{
    QByteArray bytes(width * height * 3, '\0');
    for (int y = 0; y < height; ++y) {
        for (int x = 0; x < width; ++x) {
            const int at = (y * width + x) * 3;
            bytes[at] = char(x);
            bytes[at + 1] = char(y);
            bytes[at + 2] = 7;
        }
    }
    return bytes;
}

} // namespace

class TestSample : public QObject
{
    Q_OBJECT

private slots:
    void init() { Instrument_Set_Model_Type(MODEL_REFINISH_BIRCH); }

    void clearedSampleDefaults()
    {
        Sample sample;
        QVERIFY(!sample.isValid());
        QCOMPARE(sample.getNumAngleCurves(), 6u);
        QCOMPARE(sample.getCalibrationStatus(), CALIBRATION_STATUS_REQUIRED);
        QCOMPARE(sample.getTimeStamp().toSecsSinceEpoch(), qint64(0));
        QCOMPARE(sample.getDBIndex(), 0);
        QVERIFY(!sample.getColorFilledIn() && !sample.getTextureFilledIn());
        QVERIFY(sample.getSampleThumbnail(0).isNull());

        sample.setColorFilledIn(true);
        QVERIFY(!sample.isValid());
        sample.setTemperature(21.5f);
        QVERIFY(sample.isValid());
        sample.setPosition(3);
        sample.setAcceleration(9);
        QCOMPARE(sample.getOrientation().OrientationPosition, 3);
        QCOMPARE(sample.getOrientation().OrientationAcceleration, 9);

        sample.clearContents();
        QVERIFY(!sample.isValid());
        QCOMPARE(sample.getTemperature(), 0.0f);
        QVERIFY(!sample.getColorFilledIn());
    }

    void spectraOnlyWhereTheCurveCountAllows()
    {
        Sample sample;
        // Until the server tells the real count, angles 6 and up are lost.
        sample.setRefl(8, WAVELENGTH_550, 0.5);
        QCOMPARE(sample.getRefl(8, WAVELENGTH_550), 0.0);
        sample.setRefl(5, WAVELENGTH_550, 0.25);
        QCOMPARE(sample.getRefl(5, WAVELENGTH_550), 0.25);
        sample.setRefl(5, NUM_WAVELENGTHS, 1.0);
        sample.setRefl(5, -1, 1.0);
        sample.setRefl(-1, 0, 1.0);
        QCOMPARE(sample.getRefl(5, NUM_WAVELENGTHS), 0.0);

        sample.setNumAngleCurves(200);
        QCOMPARE(sample.getNumAngleCurves(), 11u);
        sample.setRefl(8, WAVELENGTH_550, 0.5);
        QCOMPARE(sample.getRefl(8, WAVELENGTH_550), 0.5);

        double curve[NUM_WAVELENGTHS];
        for (int i = 0; i < NUM_WAVELENGTHS; ++i)
            curve[i] = i / 100.0;
        sample.setReflectances(10, curve);
        sample.setReflectances(11, curve);
        sample.setReflectances(3, nullptr);
        QCOMPARE(sample.getReflectances(10)[30], 0.30);
        // Out of range falls back to angle 0's array, never past the end.
        QCOMPARE(sample.getReflectances(11), sample.getReflectances(0));
        QCOMPARE(sample.getRefl(11, 0), 0.0);
    }

    void coordinatesFallBackToAngleZero()
    {
        Sample sample;
        sample.setLab(0, 50.0, 10.0, -20.0);
        LCH_T lch;
        lch.l = 51.0;
        lch.c = 22.4;
        lch.h = 296.6;
        sample.setLch(0, lch);
        LAB_T lab;
        lab.l = 70.0;
        lab.a = 1.0;
        lab.b = 2.0;
        sample.setLab(6, lab);

        // setLab and setLch share L*.
        QCOMPARE(sample.getLabch(0).l, 51.0);
        QCOMPARE(sample.getLab(0).a, 10.0);
        QCOMPARE(sample.getLch(0).h, 296.6);
        // Angle 6 is beyond the 6 curves: the write was lost, and the read
        // gives angle 0's values, not zeros.
        QCOMPARE(sample.getLab(6).l, 51.0);
        QCOMPARE(sample.getLab(6).b, -20.0);
        QCOMPARE(sample.getLabch(-3).c, 22.4);
    }

    void imageAngleGuards()
    {
        Sample sample;
        sample.setImageFileID(2, 77);
        sample.setImageFileID(7, 99);
        QCOMPARE(sample.getImageFileID(2), 77u);
        QCOMPARE(sample.getImageFileID(7), 0u);

        sample.setImage(positionCoded(Sample::IMAGE_WIRE_WIDTH, Sample::IMAGE_WIRE_HEIGHT), 0);
        QVERIFY(sample.hasImage(0));
        QVERIFY(!sample.hasImage(1));
        // hasImage(7) answers for angle 0.
        QVERIFY(sample.hasImage(7));

        TEXTURE_T texture;
        texture.description = "sparkle";
        sample.setTexture(texture, 6);
        QVERIFY(!sample.hasTexture(5));
        sample.setTexture(1.0, 2.0, 3.0, 4.0, 5.0, 5);
        QVERIFY(sample.hasTexture(5));
        const TEXTURE_T stored = sample.getTexture(5);
        QCOMPARE(stored.directionalCoarseness, 1.0);
        QCOMPARE(stored.sparkleGrade, 2.0);
        QCOMPARE(stored.sparkleDensity, 3.0);
        QCOMPARE(stored.sparkleIntensity, 4.0);
        QCOMPARE(stored.sparkleArea, 5.0);
        QCOMPARE(stored.simpleCoarseness, 0.0);
        QVERIFY(stored.description.isEmpty());

        TEXTURE_PARAMETER_T parameter;
        parameter.name = "Gloss";
        parameter.value = 0.5f;
        sample.setTextureParameters({parameter}, 3);
        QVERIFY(sample.hasTexture(3));
        QCOMPARE(sample.getTextureParameters(3).first().name, QString("Gloss"));
        QVERIFY(sample.getTextureParameters(9).isEmpty());
    }

    void thumbnailCrop_data()
    {
        QTest::addColumn<int>("model");
        QTest::addColumn<int>("size");
        QTest::addColumn<int>("left");
        QTest::addColumn<int>("top");
        QTest::newRow("6 cameras") << int(MODEL_REFINISH_BIRCH) << 44 << 6 << 17;
        QTest::newRow("5 cameras") << int(MODEL_REFINISH_ALDER) << 56 << 0 << 11;
    }

    void thumbnailCrop()
    {
        QFETCH(int, model);
        QFETCH(int, size);
        QFETCH(int, left);
        QFETCH(int, top);
        Instrument_Set_Model_Type(MODEL_TYPES_T(model));

        Sample sample;
        QByteArray wire = positionCoded(Sample::THUMBNAIL_WIRE_WIDTH, Sample::THUMBNAIL_WIRE_HEIGHT);
        sample.setThumbnailImage(wire, IMAGE_15);
        const QImage thumbnail = sample.getSampleThumbnail(IMAGE_15);
        QCOMPARE(thumbnail.size(), QSize(size, size));
        QCOMPARE(thumbnail.pixel(0, 0), qRgb(left, top, 7));
        QCOMPARE(thumbnail.pixel(size - 1, size - 1), qRgb(left + size - 1, top + size - 1, 7));
        // A thumbnail alone is not an image.
        QVERIFY(!sample.hasImage(IMAGE_15));
        // The crop owns its pixels.
        wire.fill('\0');
        QCOMPARE(sample.getSampleThumbnail(IMAGE_15).pixel(0, 0), qRgb(left, top, 7));
    }

    void fullPictureIsADeepCopy()
    {
        Sample sample;
        QByteArray wire = positionCoded(Sample::IMAGE_WIRE_WIDTH, Sample::IMAGE_WIRE_HEIGHT);
        sample.setImage(wire, IMAGE_DIFFUSE);
        const QImage image = sample.getSampleImage(IMAGE_DIFFUSE);
        QCOMPARE(image.size(), QSize(236, 292));
        QCOMPARE(image.format(), QImage::Format_RGB888);
        QCOMPARE(image.pixel(200, 100), qRgb(200, 100, 7));
        wire.fill('\0');
        QCOMPARE(sample.getSampleImage(IMAGE_DIFFUSE).pixel(200, 100), qRgb(200, 100, 7));

        // A short buffer gives a picture of the right size with black rows
        // where the bytes ran out.
        sample.setImage(QByteArray(708, char(0xff)), IMAGE_80);
        QCOMPARE(sample.getSampleImage(IMAGE_80).size(), QSize(236, 292));
        QCOMPARE(sample.getSampleImage(IMAGE_80).pixel(5, 0), qRgb(255, 255, 255));
        QCOMPARE(sample.getSampleImage(IMAGE_80).pixel(5, 1), qRgb(0, 0, 0));
        sample.setThumbnailImage(QByteArray(), IMAGE_80);
        QCOMPARE(sample.getSampleThumbnail(IMAGE_80).size(), QSize(44, 44));
    }

    void copiesTakeEverything()
    {
        Sample sample;
        sample.setNumAngleCurves(11);
        sample.setRefl(9, 3, 0.75);
        sample.setJobFileID("LOCAL-3");
        sample.setFileID(4);
        sample.setImage(positionCoded(Sample::IMAGE_WIRE_WIDTH, Sample::IMAGE_WIRE_HEIGHT), 2);
        sample.setColorFilledIn(true);
        Sample copy = sample;
        sample.clearContents();
        QVERIFY(copy.isValid());
        QCOMPARE(copy.getRefl(9, 3), 0.75);
        QCOMPARE(copy.getJobFileID(), QString("LOCAL-3"));
        QCOMPARE(copy.getFileID(), 4u);
        QVERIFY(copy.hasImage(2));
        QVERIFY(copy.getColorFilledIn());
        QVERIFY(!sample.hasImage(2));
    }

    void screenColourAndTimeText()
    {
        UserParams::setDefaults();
        Sample sample;
        double white[NUM_WAVELENGTHS];
        for (double& v : white)
            v = 1.0;
        sample.setReflectances(REFL_D45_45, white);
        QCOMPARE(sample.getColor(REFL_D45_45), QColor(255, 255, 255));
        QCOMPARE(sample.getColor(REFL_D45_45).alpha(), 255);
        // Black, and an angle beyond the curves reads angle 0.
        QCOMPARE(sample.getColor(REFL_D45_NEG_15), QColor(0, 0, 0));
        QCOMPARE(sample.getColor(9), sample.getColor(0));

        double grey[NUM_WAVELENGTHS];
        for (double& v : grey)
            v = 0.2;
        sample.setReflectances(0, grey);
        const QColor patch = sample.getColor(0);
        for (int channel : {patch.red(), patch.green(), patch.blue()})
            QVERIFY(channel > 60 && channel < 230);

        sample.setTimeStamp(QDateTime(QDate(2020, 2, 1), QTime(14, 5, 9)));
        QCOMPARE(sample.getTimeStampString(), QString("2:05:09 pm 02/01/20"));
        QCOMPARE(sample.getTimeStampString("yyyy-MM-dd"), QString("2020-02-01"));
    }

    void readersAndAWriterShareOneSample()
    {
        Sample sample;
        sample.setNumAngleCurves(11);
        std::atomic<bool> stop{false};
        std::thread writer([&sample, &stop] {
            int i = 0;
            while (!stop) {
                sample.setLab(i % 11, i, i, i);
                sample.setJobFileID(QString::number(i));
                ++i;
            }
        });
        double sum = 0.0;
        for (int i = 0; i < 20000; ++i) {
            const LABCH_T v = sample.getLabch(i % 11);
            sum += v.l + sample.getJobFileID().size();
        }
        stop = true;
        writer.join();
        QVERIFY(sum >= 0.0);
    }
};

QTEST_GUILESS_MAIN(TestSample)
#include "tst_sample.moc"
