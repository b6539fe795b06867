// Stored values as people read them.
#pragma once

#include <platform/orxparameter/orxparameter.h>

#include <QString>

class TransformParamCfg;

// Of a parameter with all its members or cells. `isDecoded` tells that the value is no longer word-encoded.
QString displayText(const TransformParamCfg& parameter, const QString& value, bool isDecoded);
// Of one value of a type without members; `choices` are the type's.
QString displayText(const GUIType& type, const ChoiceList& choices, const QString& value, bool isDecoded);
