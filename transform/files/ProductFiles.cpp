#include <platform/qorxcore/OrxHome.h>
#include <transform/files/ProductFiles.h>

bool isProductFile(const QString& path) {
  return QORXPrettyUpFileName(path).startsWith(QORXOrxHome() + QLatin1Char('/'));
}
