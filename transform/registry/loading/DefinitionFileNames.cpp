#include <transform/registry/loading/DefinitionFileNames.h>

#include <QRegularExpression>

namespace {

const QLatin1String kDefinitionEnd(".ort");
const QLatin1String kCategoriesStart("CategoryDefinitions");

}  // namespace

bool isDefinitionFileName(const QString& name) {
  return name.endsWith(kDefinitionEnd) || (name.startsWith(kCategoriesStart) && !isCompanionFileName(name));
}

bool isCompanionFileName(const QString& name) {
  static const QRegularExpression form(QStringLiteral("^[^/\\\\.].*-localized\\.[a-zA-Z][a-zA-Z]$"));
  return !name.endsWith(kDefinitionEnd) && form.match(name).hasMatch();  // most names are told by their end
}
