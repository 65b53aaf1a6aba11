#ifndef PARAMETERSOUTCOMMANDS_H
#define PARAMETERSOUTCOMMANDS_H

// The typed parameter store of the server. The type of a key decides its
// encoding in both directions and the member of PARAMETER_CONTENT_TYPES that
// holds it; the other members are left as they were. Each function returns a
// STATUS_T and never throws. The family shares one recursive mutex.

#include "SharedSystem/InstrumentTypes.h"

#include <QVector>

typedef enum _PARAMETER_CONTENT_KIND_T {
    PARAMETER_CONTENT_NONE = 0,   // not a key of PARAMETER_TYPE_T: no value travels
    PARAMETER_CONTENT_STRING,     // parameterString as String
    PARAMETER_CONTENT_STRING32,   // parameterString as String32
    PARAMETER_CONTENT_STRING_LIST,// paramterStringList as count and Strings
    PARAMETER_CONTENT_FLOAT,      // parameterFloat as f32
    PARAMETER_CONTENT_INT         // parameterInt as si32
} PARAMETER_CONTENT_KIND_T;

// How the value of a key travels (the same both ways, except that the web
// server address is never written).
PARAMETER_CONTENT_KIND_T CmdOut_ParameterContentKind(int key);

STATUS_T CmdOut_GetParameter(PARAMETER_TYPE_T key, PARAMETER_CONTENT_TYPES& value);
STATUS_T CmdOut_SetParameter(PARAMETER_TYPE_T key, const PARAMETER_CONTENT_TYPES& value);
STATUS_T CmdOut_SetParametersToDefaults();
STATUS_T CmdOut_GetLanguages(QVector<TAG_ITEM_T>& languages);

#endif // PARAMETERSOUTCOMMANDS_H
