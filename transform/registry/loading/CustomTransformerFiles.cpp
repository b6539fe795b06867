#include <transform/core/TransformerCfg.h>
#include <transform/custom/ExternalTransformerNetwork.h>
#include <transform/registry/ITransformerMgr.h>
#include <transform/registry/loading/CustomTransformerFiles.h>
#include <transform/workspace/AttributeScan.h>
#include <transform/workspace/PlainFile.h>
#include <transform/workspace/VersionStore.h>
#include <transform/workspace/WorkspaceLoaderException.h>

#include <algorithm>
#include <limits>

namespace {

// The build that saved a version last, told by its document without parsing it; 0 when it does not say.
int lastSaveBuild(const QString& path, const VersionInfo& version) {
  QByteArray text;
  try {
    PlainFile plain(path, QStringLiteral("kx-in-XXXXXX"));
    if (plain.device().seek(version.byteOffset))
      text = plain.device().read(version.byteLength);
    const int document = text.indexOf(QByteArray("\n") + VersionStore::kDocument);
    text = document >= 0 ? text.mid(document + 1)
                         : VersionStore(path).read(version.byteOffset, version.byteLength).document;
  } catch (const WorkspaceLoaderException&) {
    return 0;
  }
  const QByteArray build = lastAttributeValue(text, "LAST_SAVE_BUILD").trimmed();
  const bool isLarge = build.toDouble() > std::numeric_limits<int>::max();
  return isLarge ? std::numeric_limits<int>::max() : build.toInt();
}

}  // namespace

CustomTransformerFiles::CustomTransformerFiles() = default;
CustomTransformerFiles::~CustomTransformerFiles() = default;

QList<int> CustomTransformerFiles::versionsOf(const QString& name) const {
  const QString path = fileOf(name);
  QList<int> result;
  if (path.isEmpty())
    return result;
  QString error;
  for (const VersionInfo& version : VersionStore(path).versions(error)) {
    if (version.name == name)
      result.append(version.version);
  }
  std::sort(result.begin(), result.end());
  return result;
}

CustomTransformerFiles::Opened CustomTransformerFiles::open(const QString& path, int version,
                                                            TransformerSource* source) {
  Opened opened;
  auto network = std::make_unique<ExternalTransformerNetwork>(path, version, source);
  if (!network->isLoaded())
    return opened;
  opened.name = network->getName();
  opened.version = network->getVersion();

  QString error;
  QList<VersionInfo> all = VersionStore(path).versions(error);
  const auto fits = [&](int wanted) {
    const auto found = std::find_if(all.cbegin(), all.cend(),
                                    [&](const VersionInfo& info) { return info.version == wanted; });
    return found != all.cend() && lastSaveBuild(path, *found) <= TransformerCfg::kThisBuild;
  };
  if (fits(opened.version)) {
    opened.network = std::move(network);
    return opened;
  }
  if (version == ITransformerMgr::NEWEST_VERSION) {
    std::sort(all.begin(), all.end(),
              [](const VersionInfo& left, const VersionInfo& right) { return left.version > right.version; });
    for (const VersionInfo& older : all) {
      if (older.version >= opened.version || older.name != opened.name || !fits(older.version))
        continue;
      network = std::make_unique<ExternalTransformerNetwork>(path, older.version, source);
      if (!network->isLoaded())
        continue;
      opened.version = older.version;
      opened.network = std::move(network);
      return opened;
    }
  }
  opened.needsNewerBuild = true;
  return opened;
}

ExternalTransformerNetwork* CustomTransformerFiles::keep(
    std::unique_ptr<ExternalTransformerNetwork> network) {
  m_networks.push_back(std::move(network));
  return m_networks.back().get();
}

void CustomTransformerFiles::reset() {
  m_files.clear();
  // A network that goes may have held the last instances of another.
  std::size_t before = 0;
  do {
    before = m_networks.size();
    m_networks.erase(std::remove_if(m_networks.begin(), m_networks.end(),
                                    [](const auto& network) { return !network->getIsInUse(); }),
                     m_networks.end());
  } while (m_networks.size() < before);
}
