#ifndef SIMPARAMETERS_H
#define SIMPARAMETERS_H

// The server's parameter table: each key's content type (which decides its
// wire encoding), its factory default and the settings bit that a change of
// it raises in the state reply.

#include "SimModel.h"

#include <QString>
#include <QVector>

namespace Sim {
namespace Parameters {

struct Definition {
    int key = 0;
    const char* name = "";       // PARAMETER_ name without the prefix
    ParamType type = ParamType::Int;
    quint32 bit = 0;              // settings bit raised on a change, 0 for none
    ParamValue factory;
};

const QVector<Definition>& all();
// Null for a key the server does not know.
const Definition* find(int key);
// By number ("13"), by name ("AUTO_MEASURE") or full name ("PARAMETER_AUTO_MEASURE").
const Definition* findByName(const QString& nameOrNumber);

// The factory value of a key, for the model (the displayed channels depend on it).
ParamValue factoryValue(const Definition& d, Model model);

// Parses a value typed by a person for a key of this type ("1", "0.5", "a,b,c").
bool parseValue(const Definition& d, const QString& text, ParamValue* out);
QString formatValue(const ParamValue& v);

} // namespace Parameters
} // namespace Sim

#endif // SIMPARAMETERS_H
