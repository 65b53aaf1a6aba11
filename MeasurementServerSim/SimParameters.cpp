#include "SimParameters.h"

namespace Sim {
namespace Parameters {

namespace {

ParamValue intValue(qint32 v)
{
    ParamValue p;
    p.type = ParamType::Int;
    p.i = v;
    return p;
}

ParamValue floatValue(float v)
{
    ParamValue p;
    p.type = ParamType::Float;
    p.f = v;
    return p;
}

ParamValue textValue(const QString& s, ParamType type = ParamType::Text)
{
    ParamValue p;
    p.type = type;
    p.s = s;
    return p;
}

ParamValue listValue()
{
    ParamValue p;
    p.type = ParamType::List;
    return p;
}

Definition def(int key, const char* name, ParamValue v, quint32 bit = 0)
{
    Definition d;
    d.key = key;
    d.name = name;
    d.type = v.type;
    d.bit = bit;
    d.factory = v;
    return d;
}

QVector<Definition> build()
{
    QVector<Definition> d;
    d << def(PARAMETER_NUMBER_FORMAT, "NUMBER_FORMAT", textValue(QStringLiteral(".##")));
    d << def(PARAMETER_DATE_FORMAT, "DATE_FORMAT", textValue(QStringLiteral("MM/dd/yy")));
    d << def(PARAMETER_TIME_FORMAT, "TIME_FORMAT", textValue(QStringLiteral("h:mm:ss ap")));
    d << def(PARAMETER_CALIBRATION_WARNING_TIME_IN_SECONDS, "CALIBRATION_WARNING_TIME_IN_SECONDS", intValue(3600));
    d << def(PARAMETER_DISPLAYED_CHANNELS, "DISPLAYED_CHANNELS", listValue());
    d << def(PARAMETER_DEFAULT_ILLUMINANT, "DEFAULT_ILLUMINANT", intValue(D65_10));
    d << def(PARAMETER_DEFAULT_OBSERVER, "DEFAULT_OBSERVER", intValue(10));
    d << def(PARAMETER_DEFAULT_JOB_NAME, "DEFAULT_JOB_NAME", textValue(QStringLiteral("NEW JOB"), ParamType::WideText), BIT_DEFAULT_JOB_NAME);
    d << def(PARAMETER_DEFAULT_MIN_NUMBER_OF_SAMPLES, "DEFAULT_MIN_NUMBER_OF_SAMPLES", intValue(5), BIT_DEFAULT_SAMPLES);
    d << def(PARAMETER_DEFAULT_DISPLAY_DIMMER_TIME, "DEFAULT_DISPLAY_DIMMER_TIME", intValue(60), BIT_DIMMER_TIME);
    d << def(PARAMETER_DEFAULT_STANDBY_TIME, "DEFAULT_STANDBY_TIME", intValue(1800), BIT_STANDBY_TIME);
    d << def(PARAMETER_DEFAULT_POWER_OFF_TIME, "DEFAULT_POWER_OFF_TIME", intValue(3600), BIT_POWER_OFF_TIME);
    d << def(PARAMETER_DEFAULT_POWER_MANAGEMENT_LEVEL, "DEFAULT_POWER_MANAGEMENT_LEVEL", intValue(4));
    d << def(PARAMETER_AUTO_MEASURE, "AUTO_MEASURE", intValue(0), BIT_AUTO_MEASURE);
    d << def(PARAMETER_TEXT_MESSAGE, "TEXT_MESSAGE", textValue(QString(), ParamType::WideText), BIT_TEXT_MESSAGE);
    d << def(PARAMETER_DISPLAYED_IMAGE_CHANNELS, "DISPLAYED_IMAGE_CHANNELS", listValue());
    d << def(PARAMETER_DISPLAYED_SPECTRAL_CHANNELS, "DISPLAYED_SPECTRAL_CHANNELS", listValue());
    d << def(PARAMETER_ENABLE_VIEW_MEASUREMENTS_OF_COMPLETED_JOBS, "ENABLE_VIEW_MEASUREMENTS_OF_COMPLETED_JOBS", intValue(1), BIT_VIEW_MEASUREMENTS);
    d << def(PARAMETER_CURRENT_LANGUAGE_ID, "CURRENT_LANGUAGE_ID", textValue(QStringLiteral("en")), BIT_LANGUAGE);
    d << def(PARAMETER_ORIENATION_ENABLED, "ORIENATION_ENABLED", intValue(1), BIT_ORIENTATION);
    d << def(PARAMETER_JOB_COMPLETION_TIME, "JOB_COMPLETION_TIME", intValue(0));
    d << def(PARAMETER_DISPLAY_LABCH, "DISPLAY_LABCH", intValue(1));
    d << def(PARAMETER_DISPLAY_RAINBOW, "DISPLAY_RAINBOW", intValue(1));
    d << def(PARAMETER_DISPLAY_PREVIEW_IMAGES, "DISPLAY_PREVIEW_IMAGES", intValue(1));
    d << def(PARAMETER_SAMPLE_TEMP_CHECK_ACTIVE, "SAMPLE_TEMP_CHECK_ACTIVE", intValue(1));
    d << def(PARAMETER_SAMPLE_TEMP_LIMIT_LOW, "SAMPLE_TEMP_LIMIT_LOW", floatValue(15.0f));
    d << def(PARAMETER_SAMPLE_TEMP_LIMIT_HIGH, "SAMPLE_TEMP_LIMIT_HIGH", floatValue(35.0f));
    d << def(PARAMETER_AUTO_MEASURE_SWITCH_ON_UI, "AUTO_MEASURE_SWITCH_ON_UI", intValue(1));
    d << def(PARAMETER_DOWNLOADED_JOB_NAME_EDITABLE, "DOWNLOADED_JOB_NAME_EDITABLE", intValue(0));
    d << def(PARAMETER_DOWNLOADED_JOB_ATTRIBUTES_EDITABLE, "DOWNLOADED_JOB_ATTRIBUTES_EDITABLE", intValue(0));
    d << def(PARAMETER_DISPLAY_SELF_TEST, "DISPLAY_SELF_TEST", intValue(1));
    d << def(PARAMETER_SHOW_MENU_ITEM_DISPLAY_LABCH_SCREEN, "SHOW_MENU_ITEM_DISPLAY_LABCH_SCREEN", intValue(1));
    d << def(PARAMETER_SHOW_MEASUREMENT_MODE_SELECTION, "SHOW_MEASUREMENT_MODE_SELECTION", intValue(1));
    d << def(PARAMETER_SHOW_HAZARD_WARNING_BANNER, "SHOW_HAZARD_WARNING_BANNER", intValue(0));
    d << def(PARAMETER_DISPLAY_EDIT_FREE_TEXT, "DISPLAY_EDIT_FREE_TEXT", intValue(1));
    d << def(PARAMETER_TEXTURE_IMAGE_CONTENT_DATA_SELECTION, "TEXTURE_IMAGE_CONTENT_DATA_SELECTION", intValue(IMAGE_CHANNEL_CONTENT_TYPE_TEXTURE));
    d << def(PARAMETER_AUTO_MEASURE_TIMEOUT, "AUTO_MEASURE_TIMEOUT", floatValue(1.0f));
    d << def(PARAMETER_OVERRIDE_PRESSURE_SENSORS, "OVERRIDE_PRESSURE_SENSORS", intValue(0));
    d << def(PARAMETER_MEASURING_CIRCLE_ID, "MEASURING_CIRCLE_ID", textValue(QStringLiteral("colour_wheel.svg")), BIT_MEASURING_CIRCLE);
    d << def(PARAMETER_SHOW_MENU_ITEM_OVERRIDE_PRESSURE_SENSOR, "SHOW_MENU_ITEM_OVERRIDE_PRESSURE_SENSOR", intValue(1));
    d << def(PARAMETER_USE_FILTER_FILE, "USE_FILTER_FILE", intValue(1));
    d << def(PARAMETER_MEASUREMENT_MODE, "MEASUREMENT_MODE", textValue(QStringLiteral("NONE")), BIT_MEASUREMENT_MODE);
    d << def(PARAMETER_SMC_GOOD_MEASUREMENTS, "SMC_GOOD_MEASUREMENTS", intValue(3), BIT_SMC_GOOD);
    d << def(PARAMETER_SMC_MAX_MEASUREMENTS, "SMC_MAX_MEASUREMENTS", intValue(5), BIT_SMC_MAX);
    d << def(PARAMETER_AVERAGING_NUMBER_OF_SAMPLES, "AVERAGING_NUMBER_OF_SAMPLES", intValue(3), BIT_AVERAGING_NUMBER);
    d << def(PARAMETER_ONLINE_MODE_JOB, "ONLINE_MODE_JOB", textValue(QString()), BIT_ONLINE_JOB);
    d << def(PARAMETER_WHITE_TRANSFER_REQUEST, "WHITE_TRANSFER_REQUEST", intValue(0), BIT_WHITE_TRANSFER);
    d << def(PARAMETER_WEBSERVER_ADDRESS, "WEBSERVER_ADDRESS", textValue(QStringLiteral("http://192.168.1.10:8080/colour-sync")));
    d << def(PARAMETER_SYNC_JOB_TO_WEBSERVER, "SYNC_JOB_TO_WEBSERVER", textValue(QString()));
    d << def(PARAMETER_BURN_IN_TEST, "BURN_IN_TEST", intValue(0));
    return d;
}

} // namespace

const QVector<Definition>& all()
{
    static const QVector<Definition> table = build();
    return table;
}

const Definition* find(int key)
{
    for (const Definition& d : all())
        if (d.key == key)
            return &d;
    return nullptr;
}

const Definition* findByName(const QString& nameOrNumber)
{
    bool isNumber = false;
    const int key = nameOrNumber.toInt(&isNumber, 0);
    if (isNumber)
        return find(key);
    QString n = nameOrNumber.trimmed().toUpper();
    if (n.startsWith(QLatin1String("PARAMETER_")))
        n = n.mid(10);
    for (const Definition& d : all())
        if (n == QLatin1String(d.name))
            return &d;
    return nullptr;
}

ParamValue factoryValue(const Definition& d, Model model)
{
    ParamValue v = d.factory;
    if (d.key == PARAMETER_DISPLAYED_CHANNELS || d.key == PARAMETER_DISPLAYED_SPECTRAL_CHANNELS) {
        for (int a = 0; a < numSpectralAngles(model); ++a)
            v.list << spectralAngleName(a);
    } else if (d.key == PARAMETER_DISPLAYED_IMAGE_CHANNELS) {
        for (int a = 0; a < numCameraAngles(model); ++a)
            v.list << imageAngleName(a);
    }
    return v;
}

bool parseValue(const Definition& d, const QString& text, ParamValue* out)
{
    ParamValue v;
    v.type = d.type;
    bool ok = true;
    switch (d.type) {
    case ParamType::Int:
        v.i = text.trimmed().toInt(&ok, 0);
        break;
    case ParamType::Float:
        v.f = text.trimmed().toFloat(&ok);
        break;
    case ParamType::Text:
    case ParamType::WideText:
        v.s = text;
        break;
    case ParamType::List:
        v.list = text.split(QLatin1Char(','), Qt::SkipEmptyParts);
        for (QString& s : v.list)
            s = s.trimmed();
        break;
    }
    if (ok && out)
        *out = v;
    return ok;
}

QString formatValue(const ParamValue& v)
{
    switch (v.type) {
    case ParamType::Int: return QString::number(v.i);
    case ParamType::Float: return QString::number(double(v.f));
    case ParamType::Text:
    case ParamType::WideText: return QStringLiteral("\"%1\"").arg(v.s);
    case ParamType::List: return v.list.join(QLatin1Char(','));
    }
    return QString();
}

} // namespace Parameters
} // namespace Sim
