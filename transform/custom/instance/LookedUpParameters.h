// Which published parameters of a custom transformer end in a fragment that looks a choice up: their values
// must fit the fragment.
#pragma once

#include <QSet>
#include <QString>

class CompoundTransformerNetwork;

class LookedUpParameters {
 public:
  // Visits the transformers inside, at any depth.
  explicit LookedUpParameters(CompoundTransformerNetwork& network);

  // Whether there is such a fragment anywhere inside: messages in it name the instance.
  bool hasFragment() const { return m_hasFragment; }
  bool contains(const QString& parameter) const { return m_names.contains(parameter); }

 private:
  QSet<QString> m_names;
  bool m_hasFragment = false;
};
