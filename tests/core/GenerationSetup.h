// Makes configured transformers for the tests of generation, and plays the lexical part of the engine.
#pragma once

#include <tests/support/TextBuffer.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerCfgListener.h>

#include <QMap>
#include <QStringList>

#include <memory>

struct TestParameter {
  QString name;
  QString type;
  QString value;
  QString prompt = QString();
  QStringList lookup = QStringList();
};

struct TestDefinition {
  QStringList inputs;
  QStringList outputs;
  QVector<TestParameter> parameters;
  QStringList lines;
  bool nukers = false;
  QString multiProcess = QString();
};

void configure(TransformerCfg& cfg, const TestDefinition& definition);
std::unique_ptr<TransformerCfg> makeCfg(const TestDefinition& definition);

// What instantiate() writes, the statements with their continuation lines joined.
QStringList statementsOf(TransformerCfg& cfg);
// The statements of a mapping file, as docs/mapping-file.md tells an engine to read them.
QStringList readStatements(const QString& text);
// References to macros replaced, innermost first; those of unknown macros stay.
QString expandMacros(QString text, const QMap<QString, QString>& macros);

// Runs the INCLUDE [...] and Tcl2 statements with a real interpreter.
class TestEngine {
 public:
  explicit TestEngine(const QMap<QString, QString>& macros = {});
  ~TestEngine();
  void run(const QStringList& statements);
  // The value of a call "@Tcl2(...)".
  QString call(const QString& text);

  QMap<QString, QString> macros;
  QStringList messages;  // of puts_real
  QString error;         // of the interpreter, empty when all went well

 private:
  QString evaluate(const QString& script);
  struct Interpreter;
  std::unique_ptr<Interpreter> m_interpreter;
};

// Values that hold a reference are only known at run time; those with "$(P_" hold one of the same
// transformer.
class RunTimeListener : public TransformerCfgListener {
 public:
  bool isRunTimeValue(const TransformerCfg&, const QString& value) const override;
  bool isDeferredValue(const TransformerCfg& cfg, const QString& value) const override;
  // "$(Gtext)" stands for "text".
  bool expandMacros(const TransformerCfg& cfg, QString& text) const override;
};
