#include "GenerationSetup.h"

#include <transform/core/ParameterReferences.h>
#include <transform/core/TransformerDefinition.h>

#include <QRegularExpression>
#include <gtest/gtest.h>
#include <tcl.h>

void configure(TransformerCfg& cfg, const TestDefinition& definition) {
  TransformerDefinition fields;
  fields.name = "Tester";
  fields.version = 3;
  fields.inputTags = definition.inputs;
  fields.outputTags = definition.outputs;
  fields.nukersRequired = definition.nukers;
  fields.multiProcess = definition.multiProcess;
  fields.templateLines = definition.lines;
  for (const TestParameter& parameter : definition.parameters) {
    fields.parameterNames << parameter.name;
    fields.parameterTypes << parameter.type;
    fields.parameterPrompts << parameter.prompt;
    fields.parameterDefaults << QString();
    if (!parameter.lookup.isEmpty()) {
      fields.parameterLookups.insert(parameter.name, parameter.lookup);
    }
  }
  cfg.configure(fields);
  for (const TestParameter& parameter : definition.parameters) {
    EXPECT_TRUE(cfg.setParameterValue(parameter.name, parameter.value, false))
        << parameter.name.toStdString();
  }
  cfg.setBaseGuid("g1");
}

std::unique_ptr<TransformerCfg> makeCfg(const TestDefinition& definition) {
  auto cfg = std::make_unique<TransformerCfg>();
  configure(*cfg, definition);
  return cfg;
}

QStringList statementsOf(TransformerCfg& cfg) {
  TextBuffer buffer;
  EXPECT_TRUE(cfg.instantiate(buffer, "test.orw"));
  return readStatements(buffer.text());
}

QStringList readStatements(const QString& text) {
  QStringList statements;
  QString statement;
  static const QRegularExpression lineEnd("\\r\\n|\\r|\\n");
  for (const QString& line : text.split(lineEnd)) {
    if (line.endsWith('\\')) {
      statement += line.left(line.size() - 1);
    } else if (!(statement + line).trimmed().isEmpty()) {
      statements << (statement + line).trimmed();
      statement.clear();
    }
  }
  return statements;
}

QString expandMacros(QString text, const QMap<QString, QString>& macros) {
  static const QRegularExpression reference("\\$\\(([^$()\\s]+)\\)");
  int from = 0;
  for (auto match = reference.match(text); match.hasMatch(); match = reference.match(text, from)) {
    const auto macro = macros.find(match.captured(1));
    if (macro == macros.end()) {
      from = match.capturedEnd();
    } else {
      text.replace(match.capturedStart(), match.capturedLength(), *macro);
      from = 0;
    }
  }
  return text;
}

struct TestEngine::Interpreter {
  Tcl_Interp* interp = Tcl_CreateInterp();
  ~Interpreter() { Tcl_DeleteInterp(interp); }
};

namespace {

int collect(ClientData data, Tcl_Interp*, int count, Tcl_Obj* const objects[]) {
  if (count != 2) {
    return TCL_ERROR;
  }
  static_cast<QStringList*>(data)->append(QString::fromUtf8(Tcl_GetString(objects[1])));
  return TCL_OK;
}

int leave(ClientData, Tcl_Interp* interp, int, Tcl_Obj* const[]) {
  Tcl_SetObjResult(interp, Tcl_NewStringObj("exit", -1));
  return TCL_ERROR;
}

}  // namespace

TestEngine::TestEngine(const QMap<QString, QString>& given) : macros(given), m_interpreter(new Interpreter) {
  Tcl_CreateObjCommand(m_interpreter->interp, "puts_real", collect, &messages, nullptr);
  Tcl_CreateObjCommand(m_interpreter->interp, "exit", leave, nullptr, nullptr);
}

TestEngine::~TestEngine() = default;

QString TestEngine::evaluate(const QString& script) {
  const QByteArray bytes = script.toUtf8();
  if (Tcl_EvalEx(m_interpreter->interp, bytes.constData(), bytes.size(), TCL_EVAL_GLOBAL) != TCL_OK) {
    error = Tcl_GetStringResult(m_interpreter->interp);
  }
  return QString::fromUtf8(Tcl_GetStringResult(m_interpreter->interp));
}

void TestEngine::run(const QStringList& statements) {
  for (const QString& raw : statements) {
    const QString statement = expandMacros(raw, macros);
    if (statement.startsWith("INCLUDE [")) {
      QStringList lines;
      Tcl_CreateObjCommand(m_interpreter->interp, "puts", collect, &lines, nullptr);
      evaluate(statement.mid(9, statement.lastIndexOf(']') - 9));
      for (const QString& line : lines) {
        EXPECT_TRUE(line.startsWith("MACRO ")) << line.toStdString();
        macros.insert(line.section(' ', 1, 1), line.section(' ', 2).trimmed());
      }
    } else if (statement.startsWith("Tcl2 ")) {
      evaluate(statement.mid(5));
    }
  }
}

QString TestEngine::call(const QString& text) {
  const QString expanded = expandMacros(text, macros);
  EXPECT_TRUE(expanded.startsWith("@Tcl2(") && expanded.endsWith(')')) << expanded.toStdString();
  return evaluate(expanded.mid(6, expanded.size() - 7));
}

bool RunTimeListener::isRunTimeValue(const TransformerCfg&, const QString& value) const {
  return value.contains("$(G");
}

bool RunTimeListener::isDeferredValue(const TransformerCfg&, const QString& value) const {
  return value.contains("$(P");
}

bool RunTimeListener::expandMacros(const TransformerCfg&, QString& text) const {
  text = replaceParameterReferences(text, [](const QString& name, QString& value) {
    value = name.mid(1);
    return name.size() > 1 && name.startsWith('G');
  });
  return true;
}
