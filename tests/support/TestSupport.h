#ifndef TESTSUPPORT_H
#define TESTSUPPORT_H

// Helpers shared by the tests.

#include <QString>

namespace TestSupport {

// A fresh empty directory under the build's temporary area, removed at exit.
QString makeTempDir(const QString& name);

// A TCP port on 127.0.0.1 that was free a moment ago.
quint16 freeLocalPort();

} // namespace TestSupport

#endif // TESTSUPPORT_H
