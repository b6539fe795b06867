#include <platform/vtl/SystemEncoding.h>

const char* ORXSystemEncodingName() {
  return "UTF-8";
}
