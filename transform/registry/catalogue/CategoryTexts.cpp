#include <transform/registry/catalogue/CategoryTexts.h>

void CategoryTexts::setLocalizedName(const QString& category, const QString& localizedName) {
  const QString before = m_localizedNames.value(category);
  if (m_names.value(before) == category) {
    m_names.remove(before);
  }
  m_localizedNames.insert(category, localizedName);
  m_names.insert(localizedName, category);
}

bool CategoryTexts::description(const QString& category, QStringList& lines) const {
  const auto description = m_descriptions.constFind(category);
  if (description == m_descriptions.constEnd() || description.value().isEmpty()) {
    return false;
  }
  lines = description.value();
  return true;
}
