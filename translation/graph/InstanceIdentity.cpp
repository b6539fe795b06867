#include <platform/qorxcore/qorxcore.h>
#include <translation/graph/InstanceIdentity.h>

#include <QUuid>

QString instanceStem(const QStringList& documentPath, int recordIdentifier, const QString& name) {
  // The name space of every identity made here; any fixed value does.
  static const QUuid space(QStringLiteral("{6c0f3a52-7f0e-4f7c-9a31-0d8b5f0f2e11}"));
  QStringList path = documentPath;
  path << QString::number(recordIdentifier) << name;
  const QUuid uuid = QUuid::createUuidV5(space, QORXListToSdfString(path, QLatin1Char('/')));
  return uuid.toString(QUuid::WithoutBraces).replace(QLatin1Char('-'), QLatin1Char('_'));
}
