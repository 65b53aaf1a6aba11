#include "support/TestSupport.h"

#include <QDir>
#include <QTcpServer>
#include <QTemporaryDir>

#include <memory>
#include <vector>

namespace TestSupport {

QString makeTempDir(const QString& name)
{
    static std::vector<std::unique_ptr<QTemporaryDir>> dirs;
    dirs.emplace_back(new QTemporaryDir(QDir::tempPath() + "/marigold-" + name + "-XXXXXX"));
    return dirs.back()->path();
}

quint16 freeLocalPort()
{
    QTcpServer probe;
    probe.listen(QHostAddress::LocalHost, 0);
    const quint16 port = probe.serverPort();
    probe.close();
    return port;
}

} // namespace TestSupport
