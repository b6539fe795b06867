// Uses one platform library alone.
#include <platform/orxparameter/orxparameter.h>

#include <iostream>

int main() {
  const GUIType type =
      GUIType::fromGuiLine(QStringLiteral("GUI OPTIONAL CHOICE MODE fast%careful How to work:"));
  if (!type.isKnown() || type.getName() != QLatin1String("MODE")) {
    std::cerr << "the prompt line was not understood\n";
    return 1;
  }
  std::cout << type.getAsString().toStdString() << '\n';
  return 0;
}
