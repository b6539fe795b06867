// How the stored side of a choice comes into the mapping file. Decided here alone, from the stored value.
#pragma once

#include <QString>

class TransformParamCfg;
class TransformerCfg;

enum class LookupKind {
  None,       // nothing to look up, or the value depends on the feature
  RunTime,    // a fragment in front of the statements sets a macro
  Procedure,  // the value is the call of a procedure
  Stored,     // the value is known and written by its stored side
};

LookupKind lookupKind(const TransformerCfg& cfg, const TransformParamCfg& record, const QString& value);
