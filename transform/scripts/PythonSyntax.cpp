#include <transform/scripts/PythonSyntax.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>

#include <QJsonArray>
#include <QJsonDocument>
#include <QProcess>
#include <QStandardPaths>

namespace {

constexpr int kTimeLimit = 60 * 1000;  // milliseconds

const QLatin1String kProgram(
    "import json, sys\n"
    "faults = []\n"
    "for index, script in enumerate(json.load(sys.stdin)):\n"
    "    try:\n"
    "        compile(script, 'script', 'exec', dont_inherit=True)\n"
    "    except SyntaxError as error:\n"
    "        faults.append([index, error.lineno or 0, str(error.msg)])\n"
    "    except Exception as error:\n"
    "        faults.append([index, 0, str(error) or type(error).__name__])\n"
    "json.dump(faults, sys.stdout)\n");

}  // namespace

bool PythonSyntax::check(const QStringList& scripts) {
  m_faults.clear();
  m_error.clear();
  if (scripts.isEmpty()) {
    return true;
  }
  const QString program = QStandardPaths::findExecutable(QStringLiteral("python3"));
  if (program.isEmpty()) {
    m_error = TransformResString(orx::messages::kNoPython);
    return false;
  }
  QProcess python;
  // Apart from the user's own modules and settings.
  python.start(program, {QStringLiteral("-I"), QStringLiteral("-S"), QStringLiteral("-W"),
                         QStringLiteral("ignore"), QStringLiteral("-c"), kProgram});
  python.write(QJsonDocument(QJsonArray::fromStringList(scripts)).toJson(QJsonDocument::Compact));
  python.closeWriteChannel();
  if (!python.waitForFinished(kTimeLimit)) {
    m_error = python.error() == QProcess::Timedout ? TransformResString(orx::messages::kPythonSilent)
                                                   : python.errorString();
    python.kill();
    python.waitForFinished();
    return false;
  }
  const QJsonDocument answer = QJsonDocument::fromJson(python.readAllStandardOutput());
  if (python.exitStatus() != QProcess::NormalExit || python.exitCode() != 0 || !answer.isArray()) {
    const QString said = QString::fromUtf8(python.readAllStandardError()).trimmed();
    m_error = TransformResString(orx::messages::kPythonStopped, said.section(QLatin1Char('\n'), -1));
    return false;
  }
  for (const auto& value : answer.array()) {
    const QJsonArray fault = value.toArray();
    m_faults.push_back({fault.at(0).toInt(), fault.at(1).toInt(), fault.at(2).toString()});
  }
  return true;
}
