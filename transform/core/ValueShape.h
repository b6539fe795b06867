// Whether a value has the shape that its type asks for: a value where one is needed, whole rows in a table,
// every part of a multi-parameter once. Nothing mends these when they are written.
#pragma once

#include <QString>

class TransformParamCfg;

namespace value_shape {

// Why the value cannot be written; empty when nothing is wrong. A value that is empty as a whole is left to
// those who know whether there is a default.
QString fault(const TransformParamCfg& record, const QString& stored);

}  // namespace value_shape
