#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/Keywords.h>
#include <transform/registry/lint/ScriptLint.h>
#include <transform/registry/loading/DefinitionKeywords.h>
#include <transform/scripts/PythonSyntax.h>
#include <transform/scripts/ScriptBlocks.h>
#include <transform/scripts/TclSyntax.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/TextHelpers.h>

using orx::Rule;
namespace messages = orx::messages;

namespace {

const QLatin1String kTclStatement("Tcl2 ");
const QLatin1String kTclType("TEXT_EDIT_TCL");
const QLatin1String kTclParameterType("TEXT_EDIT_TCL_PARM");
const QLatin1String kPythonType("TEXT_EDIT_PYTHON");
const QLatin1String kPythonParameterType("TEXT_EDIT_PYTHON_PARM");

}  // namespace

void ScriptLint::check(const LintedDefinition& definition, LintReport& report) {
  for (const LintedDefinition::HeaderLine& line : definition.header()) {
    if (line.keyword && line.keyword->list == &TransformerDefinition::dependencyScripts) {
      checkTcl(line.value, {definition.file(), line.line.number, line.keyword->word}, report);
    }
  }
  for (const DefinitionLine& line : definition.text().templateLines) {
    if (line.text.startsWith(kTclStatement)) {
      checkTcl(line.text.mid(kTclStatement.size()), {definition.file(), line.number, kTclStatement.data()},
               report);
    }
  }
  for (const LintedParameter& parameter : definition.parameters()) {
    if (!isUnsetValue(parameter.defaultValue)) {
      checkDefault(parameter, {definition.file(), parameter.defaultLine, parameter.name}, report);
    }
  }
}

void ScriptLint::checkDefault(const LintedParameter& parameter, const Place& place, LintReport& report) {
  const QString& type = parameter.type.getType();
  const QString script = QORXWwjdDecode(parameter.defaultValue);
  QString reason;
  if (type == kTclType || type == kTclParameterType) {
    checkTcl(script, place, report);
    if (type == kTclParameterType &&
        !canWriteTclParameter(QString(), parameter.name, parameter.defaultValue, reason)) {
      report.addText(Rule::TclSyntax, messages::kScriptRefused, place.file, place.line, reason);
    }
  } else if (type == kPythonType) {
    m_python.append(script);
    m_pythonPlaces.push_back(place);
  } else if (type == kPythonParameterType) {
    if (!canWritePythonParameter(QString(), parameter.name, parameter.defaultValue, reason)) {
      report.addText(Rule::PythonSyntax, messages::kScriptRefused, place.file, place.line, reason);
      return;
    }
    // As the engine gets it, inside a function.
    m_python.append(QLatin1String("def value():\n") +
                    pythonBodyLines(QString(), parameter.defaultValue).join(QLatin1Char('\n')) +
                    QLatin1Char('\n'));
    m_pythonPlaces.push_back(place);
  }
}

void ScriptLint::checkTcl(const QString& script, const Place& place, LintReport& report) {
  const TclFault fault = findTclFault(script);
  if (!fault.text.isEmpty()) {
    report.add(Rule::TclSyntax, messages::kTclFaultOf, place.file, place.line,
               {place.owner.trimmed(), QString::number(fault.line), fault.text});
  }
}

void ScriptLint::checkPython(LintReport& report) {
  PythonSyntax python;
  if (!python.check(m_python)) {
    report.add(Rule::UncheckedPython, messages::kUncheckedPython, m_pythonPlaces.front().file,
               m_pythonPlaces.front().line, {python.errorString()});
  }
  for (const PythonFault& fault : python.faults()) {
    const Place& place = m_pythonPlaces[static_cast<std::size_t>(fault.script)];
    report.add(Rule::PythonSyntax, messages::kPythonFaultOf, place.file, place.line,
               {place.owner, QString::number(fault.line), fault.text});
  }
  m_python.clear();
  m_pythonPlaces.clear();
}
