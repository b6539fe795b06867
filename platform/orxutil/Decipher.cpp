#include <platform/orxutil/Decipher.h>

#include <utility>

namespace {

ORWDecipherRoutine& registeredRoutine() {
  static ORWDecipherRoutine routine;
  return routine;
}

}  // namespace

bool ORW_decryptWorkspace(const QString& fileName, const QString& plainCopy) {
  const ORWDecipherRoutine routine = registeredRoutine();  // a copy: the routine may register another
  return routine && routine(fileName, plainCopy);
}

void ORW_setDecipherRoutine(ORWDecipherRoutine routine) {
  registeredRoutine() = std::move(routine);
}

bool ORW_hasDecipherRoutine() {
  return static_cast<bool>(registeredRoutine());
}
