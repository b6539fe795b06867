#include <transform/text/MacroText.h>
#include <translation/mappingfile/MappingFileFlow.h>
#include <translation/mappingfile/MappingFileReport.h>

using orx::Rule;

void MappingFileFlow::addFactory(const QString& name, Role role, int line, MappingFileReport& report) {
  QHash<QString, int>& known = role == Role::Worker ? m_workers : m_factories;
  const auto earlier = known.constFind(name);
  if (earlier != known.constEnd())
    report.add(Rule::RepeatedFactory, line, {name, QString::number(earlier.value())});
  known.insert(name, line);
  const QString encoded = encodeAroundReferences(name);
  if (!m_encoded.contains(encoded)) {
    m_encoded.insert(encoded, line);
    m_encodedNames.append(encoded);
  }
}

void MappingFileFlow::addOption(const QString& name, int line) {
  if (!m_encoded.contains(name))
    m_lostOptions.push_back({name, line});
}

MappingFileFlow::Type& MappingFileFlow::type(const QString& name) {
  const auto number = m_numbers.constFind(name);
  if (number != m_numbers.constEnd())
    return m_types[number.value()];
  m_numbers.insert(name, m_types.size());
  m_types.push_back({name});
  return m_types.back();
}

void MappingFileFlow::take(const QString& name, int line) {
  Type& taken = type(name);
  taken.isTaken = true;
  if (taken.givenLine == 0)
    m_takenEarly.push_back({name, line, false});
}

void MappingFileFlow::write(const QString& name, int line) {
  type(name).isTaken = true;
  m_takenEarly.push_back({name, line, true});
}

void MappingFileFlow::give(const QString& name, int line, Role role) {
  Type& given = type(name);
  if (given.givenLine == 0)
    given.givenLine = line;
  given.isRoute = given.isRoute || role == Role::Route;
}

// Factories give their features inner names, which begin with the factory's.
bool MappingFileFlow::isInnerType(const QString& name) const {
  const int bar = name.lastIndexOf(QLatin1Char('|'));
  return bar > 0 && m_encoded.contains(name.left(bar));
}

void MappingFileFlow::finish(MappingFileReport& report) const {
  QStringList dropped;
  for (const Type& given : m_types) {
    if (given.givenLine > 0 && !given.isTaken && !given.isRoute) {
      dropped.append(given.name);
      if (!isInnerType(given.name))
        report.add(Rule::DroppedType, given.givenLine, {given.name});
    }
  }
  for (const TakenType& taken : m_takenEarly) {
    const int given = m_types[m_numbers.value(taken.name)].givenLine;
    if (given > 0 && taken.mayBeLate)
      continue;
    if (given > 0) {
      report.add(Rule::LateType, taken.line, {taken.name, QString::number(given)});
    } else if (isInnerType(taken.name) || !report.nearest(taken.name, dropped).isEmpty()) {
      // Any other type is taken for a reader's.
      report.addMisspelt(Rule::UnfedType, taken.line, {taken.name}, dropped);
    }
  }
  for (const Place& option : m_lostOptions)
    report.addMisspelt(Rule::UnknownFactory, option.line, {option.name}, m_encodedNames);
  for (const Place& run : m_runs) {
    if (m_factories.value(run.name) < run.line)
      report.addMisspelt(Rule::UnknownFactory, run.line, {run.name}, m_encodedNames);
  }
}
