// Judges the parameter values of transformers: what their own validation refuses, and references that lead
// nowhere.
#pragma once

#include <transform/findings/Findings.h>
#include <transform/findings/RuleSettings.h>
#include <translation/NearestSpelling.h>

#include <QHash>
#include <QString>
#include <QStringList>

#include <functional>
#include <vector>

class ParameterLines;
class TransformerCfg;

class ValueChecks {
 public:
  // Whether a parameter of that name can be referred to; the transformer's own need not be told.
  using Knows = std::function<bool(const QString& name)>;

  // Neither is owned.
  ValueChecks(orx::Findings& diagnostics, const orx::RuleSettings& settings);

  struct Node {
    const TransformerCfg& cfg;
    const QString& title;  // how findings name it
    const ParameterLines& lines;
    bool knowsWhatArrives;   // whether attributes can be said to be missing
    bool isUsedHere = true;  // whether what a value names has to be on this machine
  };

  // `names` are those that references may be told to mean.
  void check(const Node& node, const Knows& knows, const QStringList& names);
  // What is to be said about a reference that leads nowhere.
  QString referenceText(const QString& name, const QStringList& names);

 private:
  // A misspelt name is often met again among the same candidates.
  struct Suggestion {
    QStringList candidates;
    QString nearest;
  };

  // By parameter: the names that its value refers to without there being any.
  using LooseReferences = QHash<QString, QStringList>;

  static LooseReferences looseReferences(const Node& node, const Knows& knows);
  // A reference that a refusal shows is told with it, and taken out of `loose`; but not where such refusals
  // are turned down, which must not silence the reference.
  void reportRefusals(const Node& node, LooseReferences& loose, const QStringList& names);
  // Whether a finding of the rule counts as much as one about a reference.
  bool standsForReferences(orx::Rule rule) const;
  void reportReferences(const Node& node, LooseReferences& loose, const QStringList& names);
  // Empty when no name comes near.
  QString suggestion(const QString& name, const QStringList& candidates);
  // In front of a text that does not name the parameter itself.
  static QString shownName(const TransformerCfg& cfg, const QString& parameter);
  QString nearestName(const QString& name, const QStringList& candidates);
  QString missingText(const TransformerCfg& cfg, const QString& parameter);

  orx::Findings& m_diagnostics;
  const orx::RuleSettings& m_settings;
  NearestSpelling m_spelling;
  QHash<QString, Suggestion> m_suggestions;  // by the name that was used
};
