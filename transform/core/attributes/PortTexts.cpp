#include <transform/core/PortTables.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/attributes/PortTexts.h>
#include <transform/text/TextHelpers.h>

namespace {

const QLatin1String kIndent("   ");

}  // namespace

namespace port_texts {

QStringList inputLines(const TransformerCfg& cfg, const PortTables& ports, const QString& tag) {
  const QStringList featureTypes = cfg.getInputFeatureTypes(tag);
  if (featureTypes.isEmpty()) {
    return featureTypes;
  }
  QString name = tag;
  cfg.lookupInputTagAlias(tag, name);
  const QStringList filters = ports.inputFilters.value(tag);
  QStringList lines;
  lines.reserve(featureTypes.size());
  for (int i = 0; i < featureTypes.size(); ++i) {
    QString line = QLatin1String("INPUT ") + name + QLatin1String(" FEATURE_TYPE ") +
                   quotifyStringForMF(featureTypes.at(i));
    if (i < filters.size() && !filters.at(i).isEmpty()) {
      line += QLatin1Char(' ') + filters.at(i);
    }
    lines.append(line);
  }
  return lines;
}

QString InputTexts::add(const TransformerCfg& cfg, const PortTables& ports, const QString& tag) {
  QString text;
  for (const QString& line : inputLines(cfg, ports, tag)) {
    if (!text.isEmpty()) {
      text += kIndent;
    }
    text += line + QLatin1Char('\n');
  }
  if (!m_text.isEmpty()) {
    m_text += kIndent;
  }
  m_text += text;
  return text;
}

bool isOutputWritten(const TransformerCfg& cfg, const QString& tag, QString& featureType) {
  const bool isConnected = cfg.getOutputFeatureType(tag, featureType) && !featureType.isEmpty();
  return isConnected || cfg.nukersRequired();
}

QString outputFunctions(const TransformerCfg& cfg, const QString& tag) {
  QString text;
  for (const QString& function : cfg.getOutputTagFuncs(tag)) {
    text += QLatin1String("    ") + function + QLatin1Char('\n');
  }
  return text;
}

}  // namespace port_texts
