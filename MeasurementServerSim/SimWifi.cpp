#include "SimWifi.h"

#include "SimStore.h"

#include <QRandomGenerator>

#include <algorithm>
#include <cmath>

namespace Sim {

namespace {

int channelFrequencyMHz(int channel)
{
    if (channel >= 1 && channel <= 13)
        return 2407 + 5 * channel;
    if (channel >= 36)
        return 5000 + 5 * channel;
    return 2412;
}

WifiNetwork air(const char* ssid, const char* mac, const char* auth, const char* password, int channel, float quality,
                bool inRange)
{
    WifiNetwork n;
    n.ssid = QString::fromUtf8(ssid);
    n.mac = QString::fromLatin1(mac);
    n.authentication = QString::fromLatin1(auth);
    n.password = QString::fromUtf8(password);
    n.channel = channel;
    n.quality = quality;
    n.inRange = inRange;
    return n;
}

} // namespace

WifiRadio::WifiRadio(Store& store, Changes& changes, double timeScale, QObject* parent)
    : QObject(parent), m_store(store), m_changes(changes), m_timeScale(timeScale)
{
    m_busyTimer.setSingleShot(true);
    connect(&m_busyTimer, &QTimer::timeout, this, [this] {
        auto done = std::move(m_whenDone);
        m_whenDone = nullptr;
        if (done)
            done();
    });
}

int WifiRadio::scaled(int ms) const
{
    return std::max(1, int(std::lround(ms * m_timeScale)));
}

void WifiRadio::load(bool seedDefaults)
{
    m_networks = m_store.loadWifi();
    if (m_networks.isEmpty() && seedDefaults) {
        WifiNetwork workshop = air("Workshop-AP", "3c:84:6a:10:22:01", "WPA2-PSK", "spraybooth42", 6, 0.82f, true);
        workshop.known = true;
        workshop.storedKey = workshop.password;
        workshop.priority = 1;
        WifiNetwork office = air("Office-Net", "3c:84:6a:10:22:07", "WPA2-PSK", "colourmatch", 11, 0.0f, false);
        office.known = true;
        office.storedKey = office.password;
        m_networks << workshop << office
                   << air("Bodyshop-Guest", "a0:40:a0:71:3e:10", "OPEN", "", 1, 0.55f, true)
                   << air("Paint-Lab", "a0:40:a0:71:3e:2c", "WPA2-PSK", "spectro2024", 36, 0.41f, true)
                   << air("Warehouse-5G", "f4:92:bf:08:11:9a", "WPA2-PSK", "forklift", 44, 0.12f, true);
        m_enabled = true;
        m_connected = workshop.ssid;
        save();
    }
    m_enabled = m_store.meta(QStringLiteral("wifi.enabled"), QStringLiteral("1")) == QLatin1String("1");
    m_connected = m_store.meta(QStringLiteral("wifi.connected"));
    m_staticAddress = m_store.meta(QStringLiteral("wifi.static"));
    const WifiNetwork* c = network(m_connected);
    if (!m_enabled || !c || !c->inRange || !c->known)
        m_connected.clear();
    m_dynamicAddress = QStringLiteral("192.168.1.%1").arg(20 + int(qHash(m_mac) % 200));
}

void WifiRadio::save()
{
    m_store.begin();
    m_store.saveWifi(m_networks);
    m_store.setMeta(QStringLiteral("wifi.enabled"), m_enabled ? QStringLiteral("1") : QStringLiteral("0"));
    m_store.setMeta(QStringLiteral("wifi.connected"), m_connected);
    m_store.setMeta(QStringLiteral("wifi.static"), m_staticAddress);
    m_store.commit();
}

WifiNetwork* WifiRadio::network(const QString& ssid)
{
    for (WifiNetwork& n : m_networks)
        if (n.ssid == ssid)
            return &n;
    return nullptr;
}

const WifiNetwork* WifiRadio::network(const QString& ssid) const
{
    for (const WifiNetwork& n : m_networks)
        if (n.ssid == ssid)
            return &n;
    return nullptr;
}

WIFI_STATUS_T WifiRadio::state() const
{
    if (!m_enabled)
        return WIFI_STATUS_OFF;
    if (m_connected.isEmpty())
        return WIFI_STATUS_ON_NO_CONNECTION;
    return m_staticAddress.isEmpty() ? WIFI_STATUS_CONNECTED : WIFI_STATUS_ON_STATIC;
}

int WifiRadio::level() const
{
    const WifiNetwork* c = network(m_connected);
    if (!m_enabled || !c)
        return WIFI_LEVEL_NOT_CONNECTED;
    if (c->quality > 0.66f)
        return WIFI_LEVEL_3;
    if (c->quality > 0.33f)
        return WIFI_LEVEL_2;
    if (c->quality > 0.05f)
        return WIFI_LEVEL_1;
    return WIFI_LEVEL_0;
}

QString WifiRadio::ipString() const
{
    if (!m_enabled || m_connected.isEmpty())
        return QString();
    if (!m_staticAddress.isEmpty())
        return QStringLiteral("%1 %2").arg(m_staticAddress, m_mac);
    return QStringLiteral("%1 %2 dynamic").arg(m_dynamicAddress, m_mac);
}

QVector<NETWORK_DESCRIPTION_T> WifiRadio::networks() const
{
    QVector<NETWORK_DESCRIPTION_T> list;
    for (const WifiNetwork& n : m_networks) {
        const bool visible = m_enabled && n.inRange;
        if (!n.known && !visible)
            continue;
        NETWORK_DESCRIPTION_T d;
        d.SSID = n.ssid;
        d.MAC = n.mac;
        d.Authentication = n.authentication;
        const float q = visible ? n.quality : 0.0f;
        d.SignalLevel = visible ? QStringLiteral("%1 dBm").arg(int(std::lround(-90 + 60 * q))) : QString();
        d.Cell = QStringLiteral("Cell %1").arg(list.size() + 1, 2, 10, QLatin1Char('0'));
        d.Channel = QString::number(n.channel);
        d.Frequency = QStringLiteral("%1 GHz").arg(channelFrequencyMHz(n.channel) / 1000.0, 0, 'f', 3);
        d.Quality = q;
        d.EncryptionKey = n.authentication.compare(QLatin1String("OPEN"), Qt::CaseInsensitive) != 0;
        d.Known = n.known;
        d.Connected = m_enabled && n.ssid == m_connected;
        d.Priority = n.priority;
        list.append(d);
    }
    return list;
}

bool WifiRadio::busy() const
{
    return m_busyTimer.isActive();
}

void WifiRadio::startBusy(int ms, std::function<void()> done)
{
    m_whenDone = std::move(done);
    m_busyTimer.start(scaled(ms));
}

void WifiRadio::autoConnect()
{
    if (!m_enabled || !m_connected.isEmpty())
        return;
    const WifiNetwork* best = nullptr;
    for (const WifiNetwork& n : m_networks) {
        if (!n.known || !n.inRange)
            continue;
        const bool open = n.authentication.compare(QLatin1String("OPEN"), Qt::CaseInsensitive) == 0;
        if (!open && n.storedKey != n.password)
            continue;
        if (!best || n.priority > best->priority || (n.priority == best->priority && n.quality > best->quality))
            best = &n;
    }
    if (best)
        m_connected = best->ssid;
}

STATUS_T WifiRadio::setEnabled(bool on)
{
    if (busy())
        return ST_WIFI_BUSY;
    if (on == m_enabled)
        return ST_OK;
    if (m_failNextModeChange) {
        m_failNextModeChange = false;
        startBusy(800, [this] { emit error(ST_WIFI_MODE_ERROR, QStringLiteral("Problem occurred changing Wi-Fi modes")); });
        return ST_OK;
    }
    m_enabled = on;
    m_connected.clear();
    m_changes.settingChanged(BIT_WIFI_SETTINGS);
    save();
    if (on) {
        startBusy(1500, [this] {
            autoConnect();
            save();
            m_changes.settingChanged(BIT_WIFI_LIST);
        });
    } else {
        m_changes.settingChanged(BIT_WIFI_LIST);
        startBusy(800, nullptr);
    }
    return ST_OK;
}

STATUS_T WifiRadio::scan()
{
    if (busy())
        return ST_WIFI_BUSY;
    if (!m_enabled)
        return ST_WIFI_SCAN_ERROR;
    if (m_failNextScan) {
        m_failNextScan = false;
        startBusy(1500, [this] { emit error(ST_WIFI_SCAN_ERROR, QStringLiteral("Problem occurred scanning for Wi-Fi")); });
        return ST_OK;
    }
    startBusy(1500, [this] {
        // Signal strength is never quite the same twice.
        for (WifiNetwork& n : m_networks)
            if (n.inRange)
                n.quality = std::max(0.02f, std::min(0.98f, n.quality + float(QRandomGenerator::global()->bounded(7) - 3) / 100.0f));
        save();
        m_changes.settingChanged(BIT_WIFI_LIST);
    });
    return ST_OK;
}

STATUS_T WifiRadio::add(const QString& ssid, const QString& authentication, const QString& key, int priority)
{
    if (busy())
        return ST_WIFI_BUSY;
    if (ssid.isEmpty())
        return ST_INDEX_INVALID;
    WifiNetwork* n = network(ssid);
    if (!n) {
        // A network typed in by name that is not on the air here.
        WifiNetwork added;
        added.ssid = ssid;
        added.authentication = authentication.isEmpty() ? QStringLiteral("WPA2-PSK") : authentication;
        added.mac = QStringLiteral("00:00:00:00:00:00");
        added.inRange = false;
        m_networks.append(added);
    }
    m_joining = ssid;
    m_results.remove(ssid);
    startBusy(2000, [this, ssid, key, priority] {
        WifiNetwork* net = network(ssid);
        m_joining.clear();
        if (!net)
            return;
        const bool open = net->authentication.compare(QLatin1String("OPEN"), Qt::CaseInsensitive) == 0;
        int result = 0;
        if (!m_enabled || !net->inRange) {
            result = 2;
            net->known = true;
            net->storedKey = key;
            net->priority = priority;
        } else if (!open && key != net->password) {
            result = 1;
            net->known = false;
            net->storedKey.clear();
        } else {
            net->known = true;
            net->storedKey = key;
            net->priority = priority;
            m_connected = ssid;
        }
        m_results.insert(ssid, result);
        save();
        m_changes.settingChanged(BIT_WIFI_LIST);
    });
    return ST_OK;
}

STATUS_T WifiRadio::forget(const QString& ssid)
{
    if (busy())
        return ST_WIFI_BUSY;
    WifiNetwork* n = network(ssid);
    if (!n || !n->known)
        return ST_NO_ENTRY;
    n->known = false;
    n->storedKey.clear();
    n->priority = 0;
    m_results.remove(ssid);
    const bool wasConnected = m_connected == ssid;
    if (wasConnected)
        m_connected.clear();
    save();
    m_changes.settingChanged(BIT_WIFI_LIST);
    if (wasConnected) {
        startBusy(1000, [this] {
            autoConnect();
            save();
            m_changes.settingChanged(BIT_WIFI_LIST);
        });
    }
    return ST_OK;
}

STATUS_T WifiRadio::verify(const QString& ssid, int* result) const
{
    if (busy() && m_joining == ssid)
        return ST_WIFI_BUSY;
    if (result)
        *result = m_results.value(ssid, m_connected == ssid ? 0 : 2);
    return ST_OK;
}

void WifiRadio::setStaticAddress(const QString& address)
{
    m_staticAddress = address.trimmed();
    save();
    m_changes.settingChanged(BIT_WIFI_SETTINGS | BIT_WIFI_LIST);
}

bool WifiRadio::setNetwork(const QString& ssid, bool inRange, float quality, const QString& authentication,
                           const QString& password)
{
    if (ssid.isEmpty())
        return false;
    WifiNetwork* n = network(ssid);
    if (!n) {
        WifiNetwork added;
        added.ssid = ssid;
        added.mac = QStringLiteral("02:00:00:%1:%2:%3")
                        .arg(qHash(ssid) & 0xff, 2, 16, QLatin1Char('0'))
                        .arg((qHash(ssid) >> 8) & 0xff, 2, 16, QLatin1Char('0'))
                        .arg((qHash(ssid) >> 16) & 0xff, 2, 16, QLatin1Char('0'));
        added.authentication = QStringLiteral("OPEN");
        added.channel = 1 + int(qHash(ssid) % 11);
        m_networks.append(added);
        n = &m_networks.last();
    }
    n->inRange = inRange;
    if (quality >= 0.0f)
        n->quality = std::min(1.0f, quality);
    if (!authentication.isEmpty())
        n->authentication = authentication;
    if (!password.isNull())
        n->password = password;
    if (!inRange && m_connected == ssid)
        m_connected.clear();
    autoConnect();
    save();
    m_changes.settingChanged(BIT_WIFI_LIST);
    return true;
}

bool WifiRadio::setQuality(float quality)
{
    WifiNetwork* c = network(m_connected);
    if (!c)
        return false;
    c->quality = std::max(0.0f, std::min(1.0f, quality));
    save();
    return true;
}

} // namespace Sim
