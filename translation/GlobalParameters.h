// The global parameters of one workspace: what its header sets, what its document declares, what the caller
// gives another value.
#pragma once

#include <platform/Export.h>
#include <platform/orxparameter/orxparameter.h>
#include <transform/core/WorkspaceParameterDirectory.h>
#include <transform/custom/ScriptParameters.h>

#include <QHash>
#include <QString>
#include <QStringList>

#include <vector>

class ORX_EXPORT GlobalParameters : public WorkspaceParameterDirectory {
 public:
  struct Parameter {
    QString name;
    QString value;             // as stored: encoded where its type is, choices by their stored sides
    QString overridingValue;   // takes its place when isOverridden
    QString promptLine;        // when isPublished
    bool setInHeader = false;  // a header line sets it, so no statement of ours does
    bool isPublished = false;  // declared by a prompt line
    bool isOverridden = false;
    int line = 0;
    ScriptLanguage language = ScriptLanguage::None;  // in which the value is a script, by the prompt line

    const QString& currentValue() const { return isOverridden ? overridingValue : value; }
    // Whether a script gives the value when the mapping file runs.
    bool isComputed() const {
      return language != ScriptLanguage::None && !setInHeader && !isOverridden && !isUnsetValue(value);
    }
  };

  // Takes "MACRO NAME VALUE" and "DEFAULT_MACRO NAME VALUE" statements; every other one is passed over.
  void readHeaderLine(const QString& line, int lineNumber);
  // A value that the header sets is kept.
  void declare(const QString& name, const QString& value, int lineNumber,
               const QString& promptLine = QString());
  // A value that a document states for a parameter of that prompt line, as it would be read in a header.
  QString asStated(const QString& promptLine, const QString& value) const;
  // Gives a parameter another value. False when the workspace has no such parameter.
  bool override(const QString& name, const QString& value);

  // In order of first appearance.
  const std::vector<Parameter>& all() const { return m_parameters; }
  // Null when there is none.
  const Parameter* find(const QString& name) const;
  // By its prompt line; the null type without one.
  GUIType typeOf(const QString& name) const;
  // Groups of parameters whose values lead back to themselves through references.
  std::vector<std::vector<const Parameter*>> circles() const;

  bool isPublishedParameter(const QString& reference) const override;
  bool isPrivateParameter(const QString& reference) const override;
  bool isBuiltInParameter(const QString& reference) const override;

  // Every reference to one of these parameters replaced by its value, references inside values too. A
  // parameter that refers to itself keeps its reference as it stands.
  QString resolve(const QString& text) const;

 private:
  Parameter& entry(const QString& name);
  const Parameter* findReference(const QString& reference) const;
  QString resolve(const QString& text, QStringList& open, int& budget) const;

  std::vector<Parameter> m_parameters;
  QHash<QString, int> m_index;
};
