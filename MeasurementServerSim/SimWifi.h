#ifndef SIMWIFI_H
#define SIMWIFI_H

// The instrument's Wi-Fi radio: networks in the air around it, the ones it
// knows (with their keys and priorities), switching on and off, scanning,
// joining with a key and forgetting. Changes take the time a radio takes;
// meanwhile further Wi-Fi commands are answered with status 19 (busy).
//
// Joining checks the key against the network's own: a wrong key gives the
// verification result 1 and the network is not kept; a network out of range
// gives 2 and is kept for later. Result 0 means connected.

#include "SimChanges.h"
#include "SimModel.h"

#include <QElapsedTimer>
#include <QHash>
#include <QObject>
#include <QTimer>

#include <functional>

namespace Sim {

class Store;

class WifiRadio : public QObject
{
    Q_OBJECT

public:
    WifiRadio(Store& store, Changes& changes, double timeScale, QObject* parent = nullptr);

    // Reads the store; an empty store gets the networks of the demo workshop.
    void load(bool seedDefaults);

    bool enabled() const { return m_enabled; }
    WIFI_STATUS_T state() const;
    int level() const;
    QString connectedSsid() const { return m_connected; }
    // "address MAC dynamic" for an address from DHCP, "address MAC" for a
    // static one, empty without a connection.
    QString ipString() const;
    QString macAddress() const { return m_mac; }
    QVector<NETWORK_DESCRIPTION_T> networks() const;
    bool busy() const;

    STATUS_T setEnabled(bool on);
    STATUS_T scan();
    STATUS_T add(const QString& ssid, const QString& authentication, const QString& key, int priority);
    STATUS_T forget(const QString& ssid);
    // Status 19 while a join of that network is under way, else 0 and the result.
    STATUS_T verify(const QString& ssid, int* result) const;

    // ---- control interface ----
    void setStaticAddress(const QString& address);   // empty: back to DHCP
    QString staticAddress() const { return m_staticAddress; }
    bool setNetwork(const QString& ssid, bool inRange, float quality, const QString& authentication,
                    const QString& password);
    bool setQuality(float quality);                  // of the connected network
    void failNextModeChange() { m_failNextModeChange = true; }
    void failNextScan() { m_failNextScan = true; }

signals:
    // An error the radio reports through the server's error list.
    void error(int id, const QString& text);

private:
    WifiNetwork* network(const QString& ssid);
    const WifiNetwork* network(const QString& ssid) const;
    void startBusy(int ms, std::function<void()> done);
    void autoConnect();
    void save();
    int scaled(int ms) const;

    Store& m_store;
    Changes& m_changes;
    double m_timeScale;
    QVector<WifiNetwork> m_networks;
    bool m_enabled = true;
    QString m_connected;
    QString m_joining;
    QString m_staticAddress;
    QString m_dynamicAddress;
    QString m_mac = QStringLiteral("00:1e:c0:4d:7a:21");
    QHash<QString, int> m_results;
    QTimer m_busyTimer;
    std::function<void()> m_whenDone;
    bool m_failNextModeChange = false;
    bool m_failNextScan = false;
};

} // namespace Sim

#endif // SIMWIFI_H
