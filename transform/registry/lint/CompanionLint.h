// Checks a localised companion against the definitions that it may speak of.
#pragma once

#include <transform/registry/LintReport.h>
#include <transform/registry/lint/LintedDefinition.h>
#include <transform/registry/loading/CompanionFileParser.h>

#include <QHash>
#include <QSet>
#include <QString>

#include <memory>
#include <vector>

// What there is to be translated.
class LintedCatalogue {
 public:
  using Definitions = std::vector<std::shared_ptr<const LintedDefinition>>;

  void add(const std::shared_ptr<const LintedDefinition>& definition);
  void addCategory(const QString& category) { m_categories.insert(category); }

  // Of every version; empty for an unknown name.
  Definitions named(const QString& name) const { return m_byName.value(name); }
  bool hasCategory(const QString& category) const { return m_categories.contains(category); }

 private:
  QHash<QString, Definitions> m_byName;
  QSet<QString> m_categories;
};

class CompanionLint {
 public:
  // None is owned.
  CompanionLint(const QString& file, const LintedCatalogue& catalogue, LintReport& report)
      : m_file(file), m_catalogue(catalogue), m_report(report) {}

  // The device is open for reading. `isComplete` asks for the translation of everything that an entry's
  // transformer has.
  void check(QIODevice& device, bool isComplete);
  // The transformers that the companion has an entry for: name and version.
  const QSet<QPair<QString, int>>& translated() const { return m_translated; }

 private:
  void add(orx::Rule rule, long message, int line, const QStringList& arguments = {});
  void checkRepetitions(const std::vector<CompanionEntry::Text>& texts);
  void checkEntry(const CompanionEntry& entry, bool isComplete);
  void checkCompleteness(const CompanionEntry& entry, const LintedDefinition& definition);

  QString m_file;
  const LintedCatalogue& m_catalogue;
  LintReport& m_report;
  QSet<QPair<QString, int>> m_translated;
};
