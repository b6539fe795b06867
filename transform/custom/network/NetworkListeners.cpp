#include <transform/custom/network/NetworkListeners.h>

void NetworkListeners::add(CompoundTransformerNetworkListener* listener) {
  if (!listener || m_numbers.contains(listener))
    return;
  m_byNumber.insert(m_next, listener);
  m_numbers.insert(listener, m_next);
  ++m_next;
}

void NetworkListeners::remove(CompoundTransformerNetworkListener* listener) {
  const auto at = m_numbers.find(listener);
  if (at == m_numbers.end())
    return;
  m_byNumber.remove(*at);
  m_numbers.erase(at);
}

void NetworkListeners::clear() {
  m_byNumber.clear();
  m_numbers.clear();
}
