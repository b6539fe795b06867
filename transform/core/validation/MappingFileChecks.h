// Finds what would make the statements of one instance wrong, before anything is written.
#pragma once

#include <transform/core/CarriedReferences.h>
#include <transform/core/TransformParamCfg.h>
#include <transform/core/generation/WrittenValues.h>

#include <QHash>
#include <QString>
#include <QStringList>

#include <vector>

class OwnTokens;
class TransformerCfg;

namespace mapping_file_checks {

// Whether the buffer comes to an end with the texts of a lookup.
bool closesDeferredMacros(const ChoiceList& choices, const QStringList& texts);

}  // namespace mapping_file_checks

class MappingFileChecks {
 public:
  // None is owned; all outlive this object. `tokens` is null unless values are inserted into each other.
  MappingFileChecks(const TransformerCfg& cfg, const std::vector<TransformParamCfg>& records,
                    const OwnTokens* tokens);

  // Parameter name to the message that says why.
  QHash<QString, QString> find() const;

 private:
  // Message numbers, 0 for nothing to refuse.
  long refuse(const TransformParamCfg& record, const QString& stored) const;
  long refuseReferences(const TransformParamCfg& record, const QString& stored, const QString& written) const;
  long refuseIdentifier(const QString& value) const;
  long refuseLookup(const TransformParamCfg& record, const QString& value) const;
  long refuseParallelSetting(const TransformParamCfg& record, const QString& stored) const;
  bool refersToShownSide(const TransformParamCfg& record, const QString& value) const;
  // What stands where the template has the token of a parameter, or of a member.
  long refuseToken(const GUIType& type, const QString& stored, const QString& written) const;
  long refuseMembers(const TransformParamCfg& record, const QString& stored,
                     const QStringList& written) const;
  // Whether tokens of the transformer itself stand in the text.
  bool holdsTokens(const QString& text) const;
  bool defersOwn(const QString& stored) const;
  // What the tokens bring; false when that has no end.
  bool insertTokens(QString& text) const;
  long refuseCells(const TransformParamCfg& record, const QString& stored) const;
  // As the engine sees the text when it runs a fragment; false when that has no end.
  bool expandMacros(QString& text) const;
  // Both.
  bool expand(QString& text) const { return insertTokens(text) && expandMacros(text); }
  long refuseChoices(const ChoiceList& choices) const;

  const TransformerCfg& m_cfg;
  const std::vector<TransformParamCfg>& m_records;
  const OwnTokens* const m_tokens;
  const WrittenValues m_written;
  const carried_references::Known m_around;
};
