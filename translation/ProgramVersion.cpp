#include <translation/ProgramVersion.h>

QString programVersion() {
  return QStringLiteral("orxt " ORX_VERSION);
}
