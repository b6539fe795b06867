// Parameters whose value is computed by a script when the mapping file runs.
#pragma once

#include <platform/orxparameter/orxparameter.h>
#include <transform/core/Keywords.h>
#include <transform/text/TextHelpers.h>

enum class ScriptLanguage { None, Python, Tcl };

inline ScriptLanguage scriptLanguage(const GUIType& type) {
  if (type.getType() == QLatin1String("TEXT_EDIT_PYTHON_PARM"))
    return ScriptLanguage::Python;
  if (type.getType() == QLatin1String("TEXT_EDIT_TCL_PARM"))
    return ScriptLanguage::Tcl;
  return ScriptLanguage::None;
}
