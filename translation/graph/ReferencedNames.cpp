#include <platform/qorxcore/qorxcore.h>
#include <transform/core/ParameterReferences.h>
#include <transform/text/MFBuffer.h>
#include <translation/graph/ReferencedNames.h>

namespace {

const QLatin1String kScriptTable("ORX_MacroValues");

bool isWordCharacter(QChar c) {
  return c.isLetterOrNumber() || c == QLatin1Char('_') || c == QLatin1Char('-') || c == QLatin1Char('.');
}

QString withOrdinaryReferences(const QString& text) {
  return text.contains(QLatin1String("$[")) ? MFBuffer::withOrdinaryMacros(text) : text;
}

}  // namespace

void ReferencedNames::add(const QString& text) {
  const QString decoded = text.contains(QLatin1Char('<')) ? QORXWwjdDecode(text) : text;
  anyParameterReference(withOrdinaryReferences(decoded), [this](const QString& name) {
    m_names.insert(name);
    return false;
  });
  if (!decoded.contains(kScriptTable))
    return;
  // A script may put the name into a variable first, so every word of it counts.
  int start = 0;
  for (int i = 0; i <= decoded.size(); ++i) {
    if (i < decoded.size() && isWordCharacter(decoded.at(i)))
      continue;
    if (i > start)
      m_names.insert(decoded.mid(start, i - start));
    start = i + 1;
  }
}

QStringList ReferencedNames::inValue(const QString& value) {
  QStringList names;
  QSet<QString> seen;
  anyParameterReference(withOrdinaryReferences(value), [&](const QString& name) {
    if (!seen.contains(name)) {
      seen.insert(name);
      names.append(name);
    }
    return false;
  });
  return names;
}
