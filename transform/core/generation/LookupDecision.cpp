#include <transform/core/ExpressionWriter.h>
#include <transform/core/Keywords.h>
#include <transform/core/TransformParamCfg.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerCfgListener.h>
#include <transform/core/generation/LookupDecision.h>

namespace {

const QLatin1String kChoiceType("CHOICE");

}  // namespace

LookupKind lookupKind(const TransformerCfg& cfg, const TransformParamCfg& record, const QString& value) {
  if (!record.choices().hasLookup() || (isUnsetValue(value) && record.getFlag(kGUITypeOmittable)) ||
      ExpressionWriter::needsWrapping(record, value)) {
    return LookupKind::None;
  }
  if (cfg.listener() && cfg.listener()->isRunTimeValue(cfg, value)) {
    return LookupKind::RunTime;
  }
  return record.getType().startsWith(kChoiceType) ? LookupKind::Procedure : LookupKind::Stored;
}
