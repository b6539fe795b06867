// Finds what would make the statements of one instance wrong, before anything is written.
#pragma once

#include <transform/core/TransformParamCfg.h>

#include <QHash>
#include <QString>
#include <QStringList>

#include <vector>

class CompiledTemplate;
class TransformerCfg;

namespace mapping_file_checks {

// Whether the buffer comes to an end with the texts of a lookup.
bool closesDeferredMacros(const ChoiceList& choices, const QStringList& texts);

}  // namespace mapping_file_checks

class MappingFileChecks {
 public:
  // Neither is owned; both outlive this object.
  MappingFileChecks(const TransformerCfg& cfg, const std::vector<TransformParamCfg>& records);

  // Parameter name to the message that says why.
  QHash<QString, QString> find() const;

 private:
  // Message numbers, 0 for nothing to refuse.
  long refuse(const TransformParamCfg& record, const CompiledTemplate* compiled) const;
  long refuseIdentifier(const QString& value) const;
  long refuseLookup(const TransformParamCfg& record, const QString& value) const;
  // As the engine sees the text when it runs a fragment; false when that has no end.
  bool expandMacros(QString& text) const;
  long refuseChoices(const ChoiceList& choices) const;
  bool isMultiProcessSetting(const QString& name) const;
  bool isWrittenByRows(const TransformParamCfg& record, const CompiledTemplate* compiled) const;
  bool isReached(const TransformParamCfg& record, const CompiledTemplate* compiled) const;
  bool growsWithoutEnd() const;

  const TransformerCfg& m_cfg;
  const std::vector<TransformParamCfg>& m_records;
  bool m_bringsTokens = false;
};
