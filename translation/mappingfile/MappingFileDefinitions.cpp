#include <transform/text/TextHelpers.h>
#include <translation/graph/FlowOrder.h>
#include <translation/mappingfile/MappingFileDefinitions.h>
#include <translation/mappingfile/MappingFileReport.h>

#include <QStringList>

using orx::Rule;

namespace {

constexpr int kNeededFields = 3;

QString keyOf(const QString& name, int version) {
  return name + QLatin1Char(':') + QString::number(version);
}

}  // namespace

int MappingFileDefinitions::add(const QString& fields, int outer, int line, MappingFileReport& report) {
  const int number = static_cast<int>(m_definitions.size());
  Definition definition;
  definition.outer = outer;
  definition.line = line;
  // Only the first fields count here, however many there are.
  const QString name = fields.section(QLatin1Char(','), 0, 0).trimmed();
  bool isNumber = false;
  const int version = fields.section(QLatin1Char(','), 1, 1).trimmed().toInt(&isNumber);
  definition.isSound =
      !name.isEmpty() && isNumber && version >= 0 && fields.count(QLatin1Char(',')) + 1 >= kNeededFields;
  if (!definition.isSound) {
    report.add(Rule::BadHeader, line);
  } else {
    definition.name = name;
    definition.prefixMacro = makePrefixMacro(name);
    definition.version = version == 0 ? 1 : version;
    definition.key = keyOf(name, definition.version);
    const QString place = QString::number(outer) + QLatin1Char('/') + definition.key;
    if (m_places.contains(place))
      report.add(Rule::RepeatedDefinition, line,
                 {name, QString::number(definition.version), QString::number(m_places.value(place))});
    else
      m_places.insert(place, line);
    if (!m_numbers.contains(definition.key))
      m_numbers.insert(definition.key, number);
  }
  m_definitions.push_back(definition);
  return number;
}

void MappingFileDefinitions::include(const QString& name, int version, int includer, int line,
                                     bool byWorker) {
  m_includes.push_back({name, version, includer, line});
  m_included.insert(keyOf(name, version));
  if (byWorker)
    m_runByWorkers.insert(keyOf(name, version));
}

QSet<int> MappingFileDefinitions::open() const {
  QSet<int> result;
  for (std::size_t i = 0; i < m_definitions.size(); ++i) {
    const Definition& definition = m_definitions[i];
    if (!m_included.contains(definition.key) || m_runByWorkers.contains(definition.key) ||
        result.contains(definition.outer))
      result.insert(static_cast<int>(i));
  }
  return result;
}

void MappingFileDefinitions::reportCycles(MappingFileReport& report) const {
  std::vector<std::pair<int, int>> edges;
  for (const Include& include : m_includes) {
    const int included = m_numbers.value(keyOf(include.name, include.version), -1);
    if (included >= 0 && include.includer >= 0)
      edges.emplace_back(include.includer, included);
  }
  for (const std::vector<int>& cycle : flowOrder(static_cast<int>(m_definitions.size()), edges).cycles) {
    QStringList keys;
    for (const int member : cycle)
      keys.append(m_definitions[index(member)].key);
    report.add(Rule::DefinitionCycle, m_definitions[index(cycle.front())].line,
               {keys.join(QLatin1String(", "))});
  }
}

void MappingFileDefinitions::finish(bool isLibrary,
                                    const std::function<bool(const QString&, int)>& isInstalled,
                                    MappingFileReport& report) const {
  QHash<QString, bool> installed;
  for (const Include& include : m_includes) {
    const QString key = keyOf(include.name, include.version);
    if (m_numbers.contains(key) || !isInstalled)
      continue;
    if (!installed.contains(key))
      installed.insert(key, isInstalled(include.name, include.version));
    if (!installed.value(key))
      report.add(Rule::MissingDefinition, include.line, {include.name, QString::number(include.version)});
  }
  for (const Definition& definition : m_definitions) {
    if (definition.isSound && !m_included.contains(definition.key) && (!isLibrary || definition.outer >= 0))
      report.add(Rule::UnusedDefinition, definition.line,
                 {definition.name, QString::number(definition.version)});
  }
  reportCycles(report);
}
