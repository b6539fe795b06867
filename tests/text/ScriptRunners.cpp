#include "ScriptRunners.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QProcess>
#include <gtest/gtest.h>
#include <tcl.h>

#include <memory>

namespace {

// The lines between the first and the last become the body of a function that sees the macros.
const char kPythonRunner[] = R"(
import json, sys

def run(case):
    block = case['block']
    assert block[0] == 'INCLUDE PYTHON' and 'END_INCLUDE' in block
    body = block[1:block.index('END_INCLUDE')]
    source = 'def block(ORX_MacroValues):\n' + ''.join('  ' + line + '\n' for line in body)
    try:
        scope = {}
        exec(source, scope)
        return scope['block'](case['macros'])
    except Exception as error:
        return {'!': type(error).__name__}

json.dump([run(case) for case in json.load(sys.stdin)], sys.stdout)
)";

int collectLine(ClientData data, Tcl_Interp*, int count, Tcl_Obj* const objects[]) {
  if (count == 2) {
    static_cast<QStringList*>(data)->append(QString::fromUtf8(Tcl_GetString(objects[1])));
  }
  return count == 2 ? TCL_OK : TCL_ERROR;
}

}  // namespace

QVector<QMap<QString, QString>> runPythonBlocks(const QVector<ScriptRun>& runs) {
  QJsonArray cases;
  for (const ScriptRun& run : runs) {
    QJsonObject macros;
    for (auto it = run.macros.begin(); it != run.macros.end(); ++it) {
      macros.insert(it.key(), it.value());
    }
    cases.append(QJsonObject{{"block", QJsonArray::fromStringList(run.block)}, {"macros", macros}});
  }
  QProcess python;
  python.start("python3", {"-X", "utf8", "-W", "ignore", "-c", QString::fromLatin1(kPythonRunner)});
  python.write(QJsonDocument(cases).toJson());
  python.closeWriteChannel();
  EXPECT_TRUE(python.waitForFinished()) << "python3 is needed";
  EXPECT_EQ(python.exitCode(), 0) << python.readAllStandardError().toStdString();
  QVector<QMap<QString, QString>> results;
  for (const QJsonValue& value : QJsonDocument::fromJson(python.readAllStandardOutput()).array()) {
    const QJsonObject object = value.toObject();
    QMap<QString, QString> macros;
    for (auto it = object.begin(); it != object.end(); ++it) {
      macros.insert(it.key(), it.value().toString());
    }
    results.append(macros);
  }
  return results;
}

QMap<QString, QString> runTclBlock(const ScriptRun& run) {
  EXPECT_EQ(run.block.value(0), "INCLUDE TCL");
  const int end = run.block.indexOf("END_INCLUDE");
  EXPECT_GT(end, 0);
  const std::unique_ptr<Tcl_Interp, void (*)(Tcl_Interp*)> interpreter(Tcl_CreateInterp(), Tcl_DeleteInterp);
  QStringList lines;
  Tcl_CreateObjCommand(interpreter.get(), "puts", collectLine, &lines, nullptr);
  for (auto it = run.macros.begin(); it != run.macros.end(); ++it) {
    Tcl_SetVar2(interpreter.get(), "ORX_MacroValues", it.key().toUtf8().constData(),
                it.value().toUtf8().constData(), TCL_GLOBAL_ONLY);
  }
  const QByteArray script = run.block.mid(1, end - 1).join('\n').toUtf8();
  QMap<QString, QString> macros;
  if (Tcl_EvalEx(interpreter.get(), script.constData(), script.size(), TCL_EVAL_GLOBAL) != TCL_OK) {
    macros.insert("!", Tcl_GetStringResult(interpreter.get()));
  }
  for (const QString& line : lines) {
    EXPECT_TRUE(line.startsWith("MACRO ")) << line.toStdString();
    macros.insert(line.section(' ', 1, 1), line.section(' ', 2));
  }
  return macros;
}

QStringList asFlushed(const QStringList& block) {
  QStringList lines;
  for (const QString& line : block) {
    if (!line.isEmpty()) {
      lines << line << QString();
    }
  }
  return lines;
}
