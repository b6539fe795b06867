#include <transform/core/GenerationKeywords.h>
#include <transform/core/PortTables.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/attributes/PortTexts.h>
#include <transform/core/generation/Substitution.h>
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

}  // namespace port_texts

void PortTexts::addInputs(const TransformerCfg& cfg, const PortTables& ports) {
  QString all;
  QStringList tags;
  cfg.getInputTags(tags);
  for (const QString& tag : std::as_const(tags)) {
    QString text;
    for (const QString& line : port_texts::inputLines(cfg, ports, tag)) {
      text += (text.isEmpty() ? QString() : QString(kIndent)) + line + QLatin1Char('\n');
    }
    all += (all.isEmpty() ? QString() : QString(kIndent)) + text;
    m_texts.push_back({kInputTokenStart + tag + kInputTokenEnd, text});
  }
  m_texts.push_back({kInputLinesToken, all});
}

void PortTexts::addOutputs(const TransformerCfg& cfg) {
  QStringList tags;
  cfg.getOutputTags(tags);
  for (const QString& tag : std::as_const(tags)) {
    QString featureType;
    const bool isConnected = cfg.getOutputFeatureType(tag, featureType) && !featureType.isEmpty();
    if (!isConnected && !cfg.nukersRequired()) {
      m_texts.push_back({tag, QString(), true});
      continue;
    }
    QString functions;
    for (const QString& function : cfg.getOutputTagFuncs(tag)) {
      functions += QLatin1String("    ") + function + QLatin1Char('\n');
    }
    m_texts.push_back({kOutputTokenStart + tag + kFeatureTypeTokenEnd, quotifyStringForMF(featureType)});
    m_texts.push_back({kOutputTokenStart + tag + kFunctionsTokenEnd, functions});
  }
}

void PortTexts::putInto(Substitution& lines) const {
  for (const Text& text : m_texts) {
    if (text.isRemoved) {
      lines.removeOutput(text.token);
    } else {
      lines.substitute(text.token, text.text);
    }
  }
}
