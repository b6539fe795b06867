// One instance's text of a compiled template: values are put in the place of tokens in a single pass.
//
// The result is that of OrderedSubstitution as long as the template is plain and no value brings a token that
// is substituted (isInert() tells); the caller sees to both.
#pragma once

#include <transform/core/definition/CompiledTemplate.h>
#include <transform/core/generation/Substitution.h>

#include <QString>
#include <QStringList>
#include <QVarLengthArray>

class TemplateExpansion : public Substitution {
 public:
  // The template must outlive the expansion.
  explicit TemplateExpansion(const CompiledTemplate& compiled);

  // The first value of a slot stands. kNoSlot is ignored.
  void setValue(int slot, const QString& value);

  bool contains(const QString& token) const override;
  void substitute(const QString& token, const QString& text) override {
    setValue(m_compiled.slotOf(token), text);
  }
  void removeLinesWith(const QString& token) override;
  void removeOutput(const QString& tag) override;
  QStringList lines() const override;

  // Whether the value brings no token that `isSubstituted` tells, and no part of one, wherever it is inserted
  // in a plain template.
  template <class IsSubstituted>
  static bool isInert(const QString& value, IsSubstituted isSubstituted);

 private:
  struct Slot {
    QString value;
    bool isSet = false;
  };

  QString expand(const CompiledTemplate::Line& line, int size) const;

  const CompiledTemplate& m_compiled;
  QVarLengthArray<Slot, 24> m_slots;
  QVarLengthArray<bool, 32> m_removed;
};

#include <transform/core/TokenScanner.h>

template <class IsSubstituted>
bool TemplateExpansion::isInert(const QString& value, IsSubstituted isSubstituted) {
  TokenScanner scanner(value);
  while (scanner.next()) {
    if (isSubstituted(scanner.name().toString())) {
      return false;
    }
  }
  return !scanner.endsOpen();
}
