#ifndef SIMCONTROL_H
#define SIMCONTROL_H

// The control interface of the simulator: one text line in, a reply out.
// It is what a person, a demo script or a test does to the instrument that
// the protocol cannot: place and lift it, tilt it, drain its battery, break
// its link. The same lines arrive on the control port, on standard input and
// through Server::control(). The commands are listed by "help" and in
// README.md. A reply's last line is "OK" (possibly followed by a value) or
// "ERR" with the reason.

#include <QString>
#include <QStringList>

namespace Sim {

class Server;

class Control
{
public:
    explicit Control(Server& server);

    QString run(const QString& line);
    static QString help();

private:
    QString dispatch(const QString& command, const QStringList& args);

    Server& m_server;
};

} // namespace Sim

#endif // SIMCONTROL_H
