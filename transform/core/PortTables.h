// What is connected to the ports of one configuration object, and which attributes reach it.
#pragma once

#include <platform/Export.h>
#include <transform/core/AttributeSet.h>

#include <QHash>
#include <QString>
#include <QStringList>

struct ORX_EXPORT PortTables {
  QHash<QString, QStringList> inputFeatureTypes;
  QHash<QString, QStringList> inputFilters;
  QHash<QString, AttributeSet> inputAttributes;  // changed by TransformerCfg::setInputAttributes() alone
  QHash<QString, QString> outputFeatureTypes;
  QHash<QString, QStringList> outputFunctions;
};
