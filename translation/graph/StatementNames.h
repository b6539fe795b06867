// The names in the statements of one transformer that nobody else may use: of its factories, and of the
// features between them. Beside the transformer's own name they are those that its template, or a custom
// transformer's ports, make of it.
#pragma once

#include <QHash>
#include <QString>
#include <QStringList>

class ConfiguredDefinition;
class TransformerCfg;

class StatementNames {
 public:
  // Engines compare the names of factories decoded; so are these.
  QStringList factories(const TransformerCfg& cfg, const QString& identifier);
  // Nothing for a custom transformer.
  QStringList flows(const TransformerCfg& cfg, const QString& identifier);
  // A transformer that is divided among processes takes all factories along whose names begin with its own
  // and "|": with this beginning.
  static QStringList claimedBeginnings(const TransformerCfg& cfg, const QString& identifier);
  // Those of the beginnings that may be claimed by others which the factories of a transformer have, or a
  // single name.
  QStringList beginnings(const TransformerCfg& cfg, const QString& identifier);
  static QStringList beginnings(const QString& name);
  // Whether the name may be one that is made of others.
  static bool isUnusual(const QString& name);

 private:
  // With the tokens of the template.
  struct Names {
    QStringList factories;
    QStringList flows;
  };
  const Names& namesOf(const TransformerCfg& cfg);

  QHash<const ConfiguredDefinition*, Names> m_names;
};
