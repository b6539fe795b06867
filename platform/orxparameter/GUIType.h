// The type of a parameter: how it is edited, stored and shown.
//
// Type text, as definitions write it: [OPTIONAL ][OMITTABLE ][INSTANCE_MACROS ]TYPE[ CONFIG]. Prompt line, as
// workspaces write it: "GUI ", the type text without configuration, the parameter's name, the configuration if
// the type takes one (`""` when empty), then the prompt to the end of the line. Whether a type takes a
// configuration is told by GUITypeTable. Parsing and writing are inverse for every type of the table.
//
// A value class: copies share their text until one is changed.
#pragma once

#include <platform/Export.h>

#include <QSharedDataPointer>
#include <QString>
#include <QStringList>

struct GUITypeData;

enum GUITypeFlag : unsigned {
  kGUITypeOptional = 1,           // an empty value is allowed
  kGUITypeOmittable = 2,          // an unset value drops the template lines that use it
  kGUITypeInstanceMacros = 2048,  // references are rewritten to the instance's own macros
};

class ORX_EXPORT GUIType {
 public:
  static const GUIType& kNullGuiType;

  GUIType();
  GUIType(const GUIType&);
  GUIType(GUIType&&) noexcept;
  GUIType& operator=(const GUIType&);
  GUIType& operator=(GUIType&&) noexcept;
  ~GUIType();

  // A line that is no prompt line yields the null type.
  static GUIType fromGuiLine(const QString& line);
  // From the type text of a definition. An unknown type word is kept (isKnown() tells); an empty text yields
  // the null type.
  static GUIType fromTransformerTypeString(const QString& typeText, const QString& name = QString(),
                                           const QString& description = QString());

  bool isNull() const;
  // Whether the type word stands in the table of types.
  bool isKnown() const;

  // The type word(s) alone: no flag words, no configuration.
  const QString& getType() const;
  const QString& getName() const;
  // The prompt.
  const QString& getDescription() const;
  const QString& getConfigToken() const;
  bool getFlag(unsigned flag) const;
  unsigned getFlags() const;
  // Whether values are kept in the word encoding: types ending in "_ENCODED" and those marked in the table.
  bool valueIsEncoded() const;
  // Whether a value may be an attribute reference: types with "_OR_ATTR".
  bool mayHoldAttributeReference() const;
  // The parameter's own name and, for a MULTIPARAMETER, the names of its members. Shared, cheap.
  const QStringList& getMacroNames() const;

  // Flag words, type and configuration, as definitions write it.
  QString getTypeText() const;
  // The prompt line.
  QString getAsString() const;

  void setName(const QString& name);
  void setDescription(const QString& description);
  void setFlag(unsigned flag, bool on);

  bool operator==(const GUIType& other) const;
  bool operator!=(const GUIType& other) const { return !(*this == other); }

 private:
  QSharedDataPointer<GUITypeData> d;
};
