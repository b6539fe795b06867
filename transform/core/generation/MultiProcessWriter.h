// Writes the statement by which the engine runs a transformer in several processes. Its grammar stands in
// docs/mapping-file.md.
#pragma once

#include <QString>

class MFBuffer;
class TransformerCfg;

namespace multi_process_writer {

// The settings of an instance whose definition knows of several processes, by their stored sides. A level
// that a reference gives decides as it is known here.
struct Settings {
  bool isEnabled = false;
  QString groupBy;
  QString parallelism;
  QString processSetting;
};
Settings settingsOf(const TransformerCfg& cfg);

// Unset settings are left out. False, with nothing written, when a deferred reference in a text never closes.
bool write(MFBuffer& buffer, const TransformerCfg& cfg, const QString& groupBy, const QString& parallelism,
           const QString& processSetting);

}  // namespace multi_process_writer
