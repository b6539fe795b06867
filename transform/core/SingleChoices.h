// The single choices that a value is made of: the value itself, the elements of a list box, the results of a
// condition, the cells of a table, the members of a multi-parameter. What a choice is written as, and what is
// judged as one, is decided here alone.
#pragma once

#include <platform/Export.h>
#include <transform/core/ParameterReferences.h>

#include <QString>

#include <functional>

class ChoiceList;
class GUIType;
class TransformParamCfg;

namespace single_choices {

struct Choice {
  const GUIType& type;
  const ChoiceList& choices;
  QString text;  // decoded where it stands in a condition; references in it are as they stand
  bool refers;   // to an attribute or a macro, whose value belongs to it
};
using Replace = std::function<QString(const Choice& choice)>;

// The value with what `replace` makes of the text of each choice, packed as the value is; where nothing
// changes, the value as it is. Types that offer no choices are passed over.
ORX_EXPORT QString replaceIn(const TransformParamCfg& parameter, const QString& value,
                             const Replace& replace);
ORX_EXPORT QString replaceIn(const GUIType& type, const ChoiceList& choices, const QString& value,
                             const Replace& replace);

// The value with the stored side of each choice.
ORX_EXPORT QString toStored(const TransformParamCfg& parameter, const QString& value);

// Whether a reference among the choices leads to one as it is shown.
ORX_EXPORT bool refersToShownSide(const TransformParamCfg& parameter, const QString& value,
                                  const ExpandReferences& expand);

}  // namespace single_choices
