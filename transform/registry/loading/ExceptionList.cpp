#include <platform/qorxcore/qorxcore.h>
#include <transform/registry/loading/ExceptionList.h>

#include <QFile>
#include <QStringList>
#include <QTextStream>

namespace {

// The platforms that this build answers to.
bool isThisPlatform(const QString& platform) {
  return platform == QLatin1String("ALL") || platform == QLatin1String("WINDOWS") ||
         platform == QLatin1String("WIN64");
}

}  // namespace

void ExceptionList::readFromHome() {
  QFile file(QORXOrxHome() + QLatin1String("/pluginsinfo/transformer/exceptions.db"));
  if (file.open(QIODevice::ReadOnly))
    read(file);
}

void ExceptionList::read(QIODevice& device) {
  QTextStream stream(&device);
  stream.setCodec("utf-8");
  QString line;
  if (!stream.readLineInto(&line))
    return;
  const QStringList columns = line.split(QLatin1Char('|'));
  const int name = columns.indexOf(QStringLiteral("XFORMER_NAME"));
  const int platform = columns.indexOf(QStringLiteral("PLATFORM"));
  const int verdict = columns.indexOf(QStringLiteral("SHOULD_CREATE_TRANSFORMER"));
  if (name < 0 || platform < 0 || verdict < 0)
    return;
  const int needed = std::max({name, platform, verdict});
  while (stream.readLineInto(&line)) {
    const QStringList fields = line.split(QLatin1Char('|'));
    if (fields.size() > needed && isThisPlatform(fields.at(platform)) && !fields.at(verdict).isEmpty())
      m_allowed.insert(fields.at(name), fields.at(verdict) == QLatin1String("YES"));
  }
}
