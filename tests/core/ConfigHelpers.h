// Short ways to make configuration objects for tests.
#pragma once

#include <tests/support/QtPrinters.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerDefinition.h>

#include <QString>
#include <QStringList>

#include <vector>

// "a b c" as a list.
inline QStringList words(const char* text) {
  return QString(text).split(QLatin1Char(' '), Qt::SkipEmptyParts);
}

struct ConfigParameter {
  const char* name;
  const char* type;
  const char* prompt = "";
  const char* defaultValue = "";
};

inline TransformerDefinition makeDefinition(const std::vector<ConfigParameter>& parameters) {
  TransformerDefinition definition;
  definition.name = "Sorter";
  definition.version = 3;
  definition.inputTags = words("IN:ENTRY OTHER");
  definition.outputTags = words("OUT REST");
  for (const ConfigParameter& parameter : parameters) {
    definition.parameterNames << parameter.name;
    definition.parameterTypes << parameter.type;
    definition.parameterPrompts << parameter.prompt;
    definition.parameterDefaults << parameter.defaultValue;
  }
  return definition;
}
