// Attributes into and out of any transformer, custom ones included, without lists where its class allows it.
#pragma once

#include <platform/Export.h>
#include <transform/core/AttributeSet.h>

#include <QHash>
#include <QString>

class TransformerCfg;

namespace attribute_flow {

ORX_EXPORT void enter(TransformerCfg& cfg, const QHash<QString, AttributeSet>& attributes);
ORX_EXPORT AttributeSet leaving(const TransformerCfg& cfg, const QString& tag);

}  // namespace attribute_flow
