// The names of the parameters that texts refer to, whichever way a reference may be written: "$(NAME)",
// "$[NAME]", either of them word-encoded, or looked up by a script.
#pragma once

#include <QSet>
#include <QString>
#include <QStringList>

class ReferencedNames {
 public:
  void add(const QString& text);
  bool contains(const QString& name) const { return m_names.contains(name); }

  // What the references "$(NAME)" and "$[NAME]" of a stored value name, each once, in their order. Names that
  // no parameter can have are left out: such a text belongs to another language.
  static QStringList inValue(const QString& value);

 private:
  QSet<QString> m_names;
};
