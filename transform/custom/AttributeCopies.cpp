#include <transform/custom/AttributeCopies.h>

AttributeSet AttributeCopies::applied(const AttributeSet& leaving) const {
  AttributeSet arriving = leaving;
  for (const auto& [to, from] : m_sources) {
    if (leaving.holds(from))
      arriving.add(to);
  }
  return arriving;
}
