// One transformer's definition as its definition file gives it: plain fields, nothing interpreted yet.
//
// TransformerCfg::configure() interprets it. The meaning of each keyword stands in docs/definition-files.md.
#pragma once

#include <QHash>
#include <QString>
#include <QStringList>

struct TransformerDefinition {
  QString filePath;
  QString name;
  int version = 0;
  QString category;        // tags separated by commas
  QString pluginDialog;    // name of a special editing dialog
  int featureHolding = 0;  // bit set: 1 none, 2 grouped, 4 all

  QStringList inputTags;  // TAG[:ALIAS[:SHOWN]] each, SHOWN word-encoded
  QStringList dynamicInputTags;
  QString hiddenInputTag;
  QString hiddenOutputTag;
  QStringList outputTags;
  QStringList preservesAttributes;
  QStringList attributesAdded;
  QStringList aliases;

  // The n-th entries describe the same parameter; prompts and defaults are at least as long as the names,
  // types may be shorter when the definition is faulty.
  QStringList parameterNames;
  QStringList parameterTypes;
  QStringList parameterPrompts;
  QStringList parameterDefaults;
  QHash<QString, QStringList> parameterLookups;  // parameter name to its lookup lines

  QString multiProcess;     // name of the group-by parameter, or empty
  QStringList listActions;  // one per line of the definition
  bool nukersRequired = false;
  bool visible = true;
  bool allowed = true;  // verdict of the exception list
  QString replacedBy;
  QStringList parameterMapping;
  QStringList tagMapping;
  QString decorationName;
  bool decorationLeft = true;
  QStringList canvasProperties;
  QHash<QString, QString> tagDescriptions;
  QStringList dependencyScripts;  // Tcl, one script per line of the definition

  QString language;  // of the texts that configuring adds; empty: the current one

  QStringList templateLines;
  QStringList descriptionLines;
  QStringList tooltipLines;
  QStringList changeLog;
};
