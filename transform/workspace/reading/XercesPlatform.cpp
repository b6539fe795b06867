#include <transform/workspace/reading/XercesPlatform.h>

#include <QtGlobal>
#include <xercesc/util/PlatformUtils.hpp>

void ensureXercesPlatform() {
  static const bool ready = [] {
    XERCES_CPP_NAMESPACE::XMLPlatformUtils::Initialize();
    return true;
  }();
  Q_UNUSED(ready)
}
