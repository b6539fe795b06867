// Reads localised companions: names, prompts and texts in one language for definitions already read.
#pragma once

#include <platform/Export.h>

#include <QHash>
#include <QString>
#include <QStringList>

#include <functional>
#include <utility>
#include <vector>

class QIODevice;

// What a companion says of one transformer. A text block that is not there leaves the definition's own.
struct CompanionEntry {
  QString name;
  int version = 0;
  bool hasVersion = false;  // without one the entry serves every version
  QString localizedName;
  std::vector<std::pair<QString, QString>> prompts;  // parameter name, prompt
  std::vector<std::pair<QString, QString>> tagDescriptions;
  QStringList descriptionLines;
  QStringList tooltipLines;
  QStringList changeLog;
  int line = 0;  // of its TRANSFORMER_NAME line, from 1
};

class ORX_EXPORT CompanionFileParser {
 public:
  struct Handlers {
    std::function<void(const CompanionEntry& entry)> entry;
    std::function<void(const QString& category, const QStringList& lines)> categoryDescription;
    std::function<void(const QString& category, const QString& localizedName)> categoryName;
  };
  explicit CompanionFileParser(Handlers handlers);

  // The device is open for reading. The next TRANSFORMER_NAME line, or the file's end, ends an entry.
  void parse(QIODevice& device);

 private:
  Handlers m_handlers;
};
