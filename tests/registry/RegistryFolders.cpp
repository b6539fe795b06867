#include <tests/registry/RegistryFolders.h>
#include <tests/support/Files.h>

#include <QDir>
#include <QFileInfo>
#include <gtest/gtest.h>

RegistryFolders::RegistryFolders() {
  set("ORX_HOME", path(QStringLiteral("home")));
  set("XDG_DATA_HOME", path(QStringLiteral("data")));
  set("XDG_CONFIG_HOME", path(QStringLiteral("user")));
  set("ORX_TRANSFORMER_PATH", path(QStringLiteral("extra")));
  // Messages are those of the real home.
  QDir().mkpath(path(QStringLiteral("home")));
  QFile::link(QStringLiteral(ORX_SOURCE_DIR "/resources/messages"), path(QStringLiteral("home/messages")));
}

RegistryFolders::~RegistryFolders() {
  for (const auto& [variable, value] : m_before) {
    if (value.isNull()) {
      qunsetenv(variable.constData());
    } else {
      qputenv(variable.constData(), value);
    }
  }
}

void RegistryFolders::set(const char* variable, const QString& value) {
  m_before.emplace(variable, qEnvironmentVariableIsSet(variable) ? qgetenv(variable) : QByteArray());
  qputenv(variable, value.toUtf8());
}

QString RegistryFolders::write(const QString& name, const QByteArray& content) {
  const QString whole = path(name);
  QDir().mkpath(QFileInfo(whole).path());
  put(whole, content);
  return whole;
}

TransformerMgr& RegistryFolders::load() {
  TransformerMgr& registry = TransformerMgr::getTransformerMgr();
  registry.loadTransformers(&m_session);
  return registry;
}

QByteArray tidyDocument(int build) {
  return readAll(ORX_SOURCE_DIR "/tests/data/documents/tidy.xml")
      .replace("_BUILD=\"1\"", "_BUILD=\"" + QByteArray::number(build) + '"');
}

QByteArray definitionText(const char* name, int version, const QByteArray& header) {
  return QByteArray("TRANSFORMER_NAME: ") + name + "\nVERSION: " + QByteArray::number(version) +
         "\nINPUT_TAGS: INPUT\nOUTPUT_TAGS: OUTPUT\n" + header +
         "\nTEMPLATE_START\nFACTORY_DEF * TeeFactory FACTORY_NAME $(XFORMER_NAME) "
         "$(INPUT_LINES)\nTEMPLATE_END\n";
}
