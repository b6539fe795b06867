// Whether a value is one that its type offers: an entry of a choice or list box, one of the two values of a
// check box, a number within the range of a slider; where one is needed, none that a reference makes empty.
//
// An unset value, one that refers to an attribute or to a parameter that is not known, and one that is a
// function, is told only when it is used. Of a condition the results are judged that are choices, or numbers
// as they stand.
#pragma once

#include <platform/Export.h>
#include <platform/orxparameter/orxparameter.h>
#include <transform/core/ParameterReferences.h>
#include <transform/findings/Rules.h>

#include <QString>
#include <QStringList>

#include <vector>

class TransformParamCfg;

struct ORX_EXPORT ValueFit {
  // The first says that nothing is wrong.
  enum class Misfit { None, Choice, Number, WholeNumber, Range, Nothing };

  Misfit misfit = Misfit::None;
  QString prompt;       // of the member or column; empty when the parameter itself is meant
  QString value;        // what does not fit: the value, or one piece of it
  QStringList offered;  // the choices as they are shown, or the two ends of the range

  bool fits() const { return misfit == Misfit::None; }
  orx::Rule rule() const;
  // What is wrong: its number in orx::messages, and its text in the current language.
  long message() const;
  QString text() const;

  // `choices` are those of the type, with their lookups.
  static ValueFit of(const GUIType& type, const ChoiceList& choices, const QString& value);
  static ValueFit of(const GUIType& type, const QString& value) { return of(type, ChoiceList(type), value); }
  // All that does not fit in a parameter with members or columns, or in the value itself, the references in
  // it carried out where `expand` is given.
  static std::vector<ValueFit> misfitsOf(const TransformParamCfg& parameter, const QString& value,
                                         const ExpandReferences& expand = nullptr);
};
