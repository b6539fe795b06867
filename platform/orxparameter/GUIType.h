// The type of a parameter: how it is edited, stored and shown.
//
// Type text, as definitions write it: [OPTIONAL ][OMITTABLE ][INSTANCE_MACROS ]TYPE[ CONFIG]. Prompt line, as
// workspaces write it: "GUI ", the type text without configuration, the parameter's name, the configuration
// if the type takes one (`""` when empty), then the prompt to the end of the line. Whether a type takes a
// configuration is told by GUITypeTable. Parsing and writing are inverse for every type of the table.
//
// Flag words are read in any order and written in the order above. Words are parted by any number of blanks;
// behind the name or the configuration exactly one blank is taken away, so that a prompt keeps its own.
//
// In a prompt line a name that is empty, holds a blank or begins with a quote stands in double quotes, inner
// quotes doubled. A line feed or carriage return in a name or prompt is written "<u000a>" or "<u000d>"; a "<"
// that stands before "u000a>", "u000d>" or "lessthansign>" is written "<lessthansign>", all other text as it
// is.
//
// Configurations are described in ConfigToken.h.
//
// A value class: copies share one block of text that never changes; setters make a new block. Copies may be
// used in several threads at once.
#pragma once

#include <platform/Export.h>

#include <QString>
#include <QStringList>

#include <memory>

struct GUITypeData;

enum GUITypeFlag : unsigned {
  kGUITypeOptional = 1,           // an empty value is allowed
  kGUITypeOmittable = 2,          // an unset value drops the template lines that use it
  kGUITypeInstanceMacros = 2048,  // references are rewritten to the instance's own macros
};

class ORX_EXPORT GUIType {
 public:
  // Initialised at compile time, so it may be used while the objects of other files are being initialised.
  static const GUIType& kNullGuiType;

  constexpr GUIType() noexcept = default;

  // A line that is no prompt line ("GUI ", a type and a name) yields the null type. A line end behind the
  // line is dropped. Of an unknown type everything behind the name is the prompt.
  static GUIType fromGuiLine(const QString& line);
  // From the type text of a definition. An unknown type word is kept (isKnown() tells); a text without a type
  // word yields the null type. All that stands behind the type word is the configuration, also when its
  // pieces with blanks lack their quotes (they are added) or when the type takes none: getConfigToken() and
  // getTypeText() then still give it, the prompt line of a type of the table does not.
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
  // Empty for a configuration of `""`.
  const QString& getConfigToken() const;
  // Whether all bits of `flag` are set.
  bool getFlag(unsigned flag) const;
  unsigned getFlags() const;
  // Whether values are kept in the word encoding: types ending in "_ENCODED" and those marked in the table.
  bool valueIsEncoded() const;
  // Whether a value may be an attribute reference: types with "_OR_ATTR".
  bool mayHoldAttributeReference() const;
  // The parameter's own name (unless empty) and, for a MULTIPARAMETER, the names of its members. Shared,
  // cheap.
  const QStringList& getMacroNames() const;

  // Flag words, type and configuration, as definitions write it.
  QString getTypeText() const;
  // The prompt line; empty for the null type.
  QString getAsString() const;

  void setName(const QString& name);
  void setDescription(const QString& description);
  // Bits without a flag word are kept but never written.
  void setFlag(unsigned flag, bool on);

  bool operator==(const GUIType& other) const;
  bool operator!=(const GUIType& other) const { return !(*this == other); }

 private:
  std::shared_ptr<const GUITypeData> d;
};
