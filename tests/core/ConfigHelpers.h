// Short ways to make configuration objects for tests.
#pragma once

#include <tests/support/QtPrinters.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerDefinition.h>

#include <QString>
#include <QStringList>

#include <vector>

inline QString qs(const char* text) {
  return QString::fromUtf8(text);
}

// "a b c" as a list.
inline QStringList words(const char* text) {
  return qs(text).split(QLatin1Char(' '), Qt::SkipEmptyParts);
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
