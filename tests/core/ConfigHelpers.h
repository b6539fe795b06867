// Short ways to make configuration objects for tests.
#pragma once

#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerDefinition.h>

#include <QString>
#include <QStringList>

#include <ostream>
#include <vector>

inline QString qs(const char* text) {
  return QString::fromUtf8(text);
}

// "a b c" as a list.
inline QStringList words(const char* text) {
  return qs(text).split(QLatin1Char(' '), Qt::SkipEmptyParts);
}

inline void PrintTo(const QString& text, std::ostream* out) {
  *out << '"' << text.toUtf8().constData() << '"';
}

inline void PrintTo(const QStringList& list, std::ostream* out) {
  *out << '[' << list.join(QLatin1String(" | ")).toUtf8().constData() << ']';
}

struct ConfigParameter {
  const char* name;
  const char* type;
  const char* prompt = "";
  const char* defaultValue = "";
};

inline TransformerDefinition makeDefinition(const std::vector<ConfigParameter>& parameters) {
  TransformerDefinition definition;
  definition.name = qs("Sorter");
  definition.version = 3;
  definition.inputTags = words("IN:ENTRY OTHER");
  definition.outputTags = words("OUT REST");
  for (const ConfigParameter& parameter : parameters) {
    definition.parameterNames << qs(parameter.name);
    definition.parameterTypes << qs(parameter.type);
    definition.parameterPrompts << qs(parameter.prompt);
    definition.parameterDefaults << qs(parameter.defaultValue);
  }
  return definition;
}
