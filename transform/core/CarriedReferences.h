// What references to macros bring into a value. An engine puts the values of macros in their places inside
// words, calls and lists that it has told apart already, or is yet to: what is known of them is judged as the
// engine sees it.
#pragma once

#include <platform/Export.h>
#include <platform/orxparameter/orxparameter.h>
#include <transform/core/ParameterReferences.h>

#include <QString>

#include <functional>

class TransformParamCfg;
class TransformerCfg;

namespace carried_references {

// How a text is spelt that a reference brings.
enum class Spelling {
  Unknown,  // like what stands around the reference
  Plain,
  Word,  // word-encoded
  Call,  // a function call, or a quoted name, that means itself only when nothing stands beside it
};

// What is known of references.
struct Known {
  ExpandReferences expand;
  std::function<Spelling(const QString& name)> spellingOf;
};
ORX_EXPORT Spelling spellingOf(const GUIType& type);

// For listeners that know the types of the parameters around a transformer.
class ORX_EXPORT ScopeTypes {
 public:
  virtual ~ScopeTypes();
  // The null type when there is no such parameter, or nobody has told its type.
  virtual GUIType typeOf(const QString& parameter) const = 0;
};
// By the listener of the transformer. Its own parameters are not looked at.
ORX_EXPORT Known knownAround(const TransformerCfg& cfg);

// With its own ones, which come first.
ORX_EXPORT Known knownWithin(const TransformerCfg& cfg);
// Whether a parameter of that name stands around the transformer, whose reference is left to the engine.
ORX_EXPORT bool isAround(const TransformerCfg& cfg, const QString& parameter);

// How a table reaches its statement: as one packed text, or cell by cell.
enum class TableForm { Packed, ByRows };

// The number of the message that says why a text that a reference of the stored value stands for would change
// what is around it, or would be read as another one than people see; 0 when none would. `written` is what
// is made of the value for the statements.
ORX_EXPORT long refuse(const TransformParamCfg& record, const QString& stored, const QString& written,
                       TableForm form, const Known& known);
// The same for a value that becomes a macro's.
ORX_EXPORT long refuseInMacro(const GUIType& type, const QString& stored, const Known& known);

// Whether the engine decodes what a part of a value brings into a statement.
ORX_EXPORT bool isReadDecoded(const GUIType& type, const QString& part);
// Whether a text that a reference brings stays one piece of an expression.
ORX_EXPORT bool fitsExpression(const QString& text);

}  // namespace carried_references
