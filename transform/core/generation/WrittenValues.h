// Which parameters' values reach the statements of an instance: those that are asked for when it is written,
// and judged before.
#pragma once

class CompiledTemplate;
class TransformParamCfg;
class TransformerCfg;

class WrittenValues {
 public:
  // Not owned. With `bringsTokens`, values are inserted into each other, so that any may be reached.
  WrittenValues(const TransformerCfg& cfg, bool bringsTokens);

  bool contains(const TransformParamCfg& record) const;
  // Whether a class of its own writes the table, which the template leaves out, in statements behind it.
  bool isWrittenByRows(const TransformParamCfg& record) const;
  // Whether the template holds the parameter's token; whether some line may end with the value.
  bool isToken(const TransformParamCfg& record) const;
  // Whether the value is also written as a quoted word: in the list of values, or beside the workers.
  bool isWord(const TransformParamCfg& record) const;
  bool mayEndLine(const TransformParamCfg& record) const;
  bool isMultiProcessSetting(const TransformParamCfg& record) const;

  // Labels and frames of a dialog have no value.
  static bool hasValue(const TransformParamCfg& record);

 private:
  const TransformerCfg& m_cfg;
  const CompiledTemplate* const m_compiled;  // null without a template: the values are written as macros
  const bool m_bringsTokens;
};
