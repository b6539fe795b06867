#include <platform/qorxcore/qorxcore.h>
#include <transform/core/GenerationKeywords.h>
#include <transform/core/Keywords.h>
#include <transform/core/ParallelLevels.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/text/MacroText.h>
#include <transform/text/MappingFileKeywords.h>
#include <transform/text/MappingFileWords.h>
#include <translation/graph/StatementNames.h>

#include <algorithm>

namespace {

constexpr QLatin1Char kBar('|');

QString token(QLatin1String name) {
  return kMacroOpen + name + QLatin1Char(')');
}

}  // namespace

const StatementNames::Names& StatementNames::namesOf(const TransformerCfg& cfg) {
  const auto known = m_names.constFind(cfg.definition());
  if (known != m_names.constEnd())
    return known.value();
  Names names;
  for (const QString& line : cfg.getTemplateLines()) {
    MappingFileWords words(line);
    QString before;
    for (MappingFileWord word; words.next(word);) {
      const QString text = word.value();
      const bool isMade =
          text.contains(token(kEncodedNameToken)) || text.contains(token(kIdentifierParameter));
      if (isMade && before == kFactoryNameKeyword)
        names.factories.append(text);
      else if (isMade && before == kFeatureTypeKeyword)
        names.flows.append(text);
      before = text;
    }
  }
  names.flows.removeDuplicates();
  return *m_names.insert(cfg.definition(), names);
}

QStringList StatementNames::factories(const TransformerCfg& cfg, const QString& identifier) {
  QStringList names;
  if (CompoundTransformerNetwork* network = networkOf(&cfg)) {
    names.append(identifier);
    for (const QString& port : network->getInputs())
      names.append(identifier + QLatin1Char(' ') + port + kInputCollectorName);
    for (const QString& port : network->getOutputs())
      names.append(identifier + QLatin1Char(' ') + port + kOutputRenamerName);
  }
  for (QString name : namesOf(cfg).factories) {
    name.replace(token(kEncodedNameToken), identifier).replace(token(kIdentifierParameter), identifier);
    names.append(name);
  }
  for (QString& name : names)
    name = QORXWwjdDecode(name);
  return names;
}

QStringList StatementNames::flows(const TransformerCfg& cfg, const QString& identifier) {
  QStringList names = namesOf(cfg).flows;
  if (names.isEmpty())
    return names;
  const QString encoded = encodeAroundReferences(identifier);
  for (QString& name : names)
    name.replace(token(kEncodedNameToken), encoded).replace(token(kIdentifierParameter), identifier);
  return names;
}

QStringList StatementNames::claimedBeginnings(const TransformerCfg& cfg, const QString& identifier) {
  return !isCustomTransformer(&cfg) && mayBeDivided(cfg) ? QStringList(identifier + kBar) : QStringList();
}

QStringList StatementNames::beginnings(const TransformerCfg& cfg, const QString& identifier) {
  QStringList found;
  for (const QString& name : isCustomTransformer(&cfg) ? factories(cfg, identifier) : QStringList(identifier))
    found += beginnings(name);
  return found;
}

QStringList StatementNames::beginnings(const QString& name) {
  QStringList found;
  for (int at = name.indexOf(kBar); at >= 0; at = name.indexOf(kBar, at + 1))
    found.append(QORXWwjdDecode(name.left(at + 1)));
  return found;
}

bool StatementNames::isUnusual(const QString& name) {
  return name.contains(kBar) || name.contains(QLatin1Char('<')) || name.endsWith(kCollectorName) ||
         name.endsWith(kOutputRenamerName) || name.endsWith(kAttributeCopierName);
}
