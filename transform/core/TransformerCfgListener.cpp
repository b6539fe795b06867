#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/TransformerCfgListener.h>

TransformerCfgListener::~TransformerCfgListener() = default;

QString TransformerCfgListener::rewriteValue(const TransformerCfg&, const QString&, const QString& value) {
  return value;
}

void TransformerCfgListener::parameterChanged(TransformerCfg&, const QString&, const QString&,
                                              const QString&) {}

QString TransformerCfgListener::unpackValue(const TransformerCfg&, const QString& value, bool isEncoded,
                                            UnpackLevel level) const {
  return isEncoded && level == UnpackLevel::Decoded ? QORXWwjdDecode(value) : value;
}

bool TransformerCfgListener::isRunTimeValue(const TransformerCfg&, const QString&) const {
  return false;
}

bool TransformerCfgListener::isDeferredValue(const TransformerCfg&, const QString&) const {
  return false;
}

bool TransformerCfgListener::acceptsValue(const TransformerCfg&, const QString&, const QString&) const {
  return false;
}

QString TransformerCfgListener::resolveUserTypedMacro(const TransformerCfg&, const QString& value,
                                                      UnpackLevel) const {
  return value;
}

QString TransformerCfgListener::resolveDefaultValue(const TransformerCfg&, const QString& value) const {
  return value;
}

bool TransformerCfgListener::expandMacros(const TransformerCfg&, QString&) const {
  return true;
}

bool TransformerCfgListener::expandByUnpacking(const TransformerCfg& cfg, QString& text) const {
  // A round takes values inside values; a further one is needed where a name is put together from values.
  constexpr int kMostRounds = 8;
  for (int round = 0; round < kMostRounds; ++round) {
    if (!isRunTimeValue(cfg, text)) {
      return true;
    }
    const QString unpacked = unpackValue(cfg, text, false, UnpackLevel::Resolved);
    if (unpacked == text) {
      return false;
    }
    text = unpacked;
  }
  return false;
}
