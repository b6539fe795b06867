// The definitions of custom transformers in a mapping file, and the statements that include them.
#pragma once

#include <QHash>
#include <QSet>
#include <QString>

#include <functional>
#include <vector>

class MappingFileReport;

class MappingFileDefinitions {
 public:
  // Notes the definition whose opening line has these fields; `outer` is the one that it stands in, or -1.
  // The answer is its number.
  int add(const QString& fields, int outer, int line, MappingFileReport& report);
  // `includer` is the definition that the statement stands in, or -1.
  // A worker sets the definition's macros by itself.
  void include(const QString& name, int version, int includer, int line, bool byWorker);

  // The name of the prefix macro of a definition.
  const QString& prefixMacro(int definition) const { return m_definitions[index(definition)].prefixMacro; }
  // Those whose macros the file need not set: that no statement includes, that a worker runs, or that stand
  // in such a one.
  QSet<int> open() const;

  // How much is remembered.
  std::size_t size() const { return m_definitions.size() + m_includes.size(); }
  // `isLibrary` tells that the file is there for others to include.
  void finish(bool isLibrary, const std::function<bool(const QString&, int)>& isInstalled,
              MappingFileReport& report) const;

 private:
  struct Definition {
    QString key;
    QString name;
    QString prefixMacro;
    int version = 0;
    int outer = -1;
    int line = 0;
    bool isSound = false;
  };
  struct Include {
    QString name;
    int version;
    int includer;
    int line;
  };

  static std::size_t index(int number) { return static_cast<std::size_t>(number); }
  void reportCycles(MappingFileReport& report) const;

  std::vector<Definition> m_definitions;
  QHash<QString, int> m_numbers;  // the first by name and version
  QHash<QString, int> m_places;   // the same, by the definition around it as well
  std::vector<Include> m_includes;
  QSet<QString> m_included;  // names and versions
  QSet<QString> m_runByWorkers;
};
