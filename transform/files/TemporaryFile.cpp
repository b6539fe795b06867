#include <transform/files/TemporaryFile.h>

#include <QDir>

TemporaryFile::TemporaryFile(const QString& nameTemplate)
    : QTemporaryFile(QDir::tempPath() + QLatin1Char('/') + nameTemplate) {}
