// Judges the parameter values of transformers: what their own validation refuses, and references that lead
// nowhere.
#pragma once

#include <translation/Diagnostics.h>
#include <translation/NearestSpelling.h>

#include <QHash>
#include <QString>
#include <QStringList>

#include <functional>
#include <vector>

class TransformerCfg;
struct TransformerStruct;

class ValueChecks {
 public:
  // Whether a parameter of that name can be referred to; the transformer's own need not be told.
  using Knows = std::function<bool(const QString& name)>;

  // Not owned.
  explicit ValueChecks(Diagnostics& diagnostics);

  // `title` is how findings name the node; `record` is what the document says about it.
  // `knowsWhatArrives`: whether attributes can be said to be missing.
  void checkValues(const TransformerCfg& cfg, const TransformerStruct& record, const QString& title,
                   bool knowsWhatArrives);
  // References of the record's values to parameters that there are not. `names` are those to suggest.
  void checkReferences(const TransformerCfg& cfg, const TransformerStruct& record, const QString& title,
                       const Knows& knows, const QStringList& names);

 private:
  // The fixed text around the argument of a message, by which a refusal's rule is told.
  struct Form {
    Rule rule;
    QString before;
    QString behind;
  };

  // A misspelt name is often met again among the same candidates.
  struct Suggestion {
    QStringList candidates;
    QString nearest;
  };

  Rule ruleOf(const QString& message) const;
  QString nearestName(const QString& name, const QStringList& candidates);
  QString missingText(const TransformerCfg& cfg, const QString& parameter);

  Diagnostics& m_diagnostics;
  NearestSpelling m_spelling;
  QHash<QString, Suggestion> m_suggestions;  // by the name that was used
  std::vector<Form> m_forms;
};
