// The listeners of one network, in the order of registration. Listeners may come and go while they are told.
#pragma once

#include <QHash>
#include <QMap>

class CompoundTransformerNetworkListener;

class NetworkListeners {
 public:
  // A listener that is registered already stays where it is.
  void add(CompoundTransformerNetworkListener* listener);
  void remove(CompoundTransformerNetworkListener* listener);
  void clear();
  bool isEmpty() const { return m_numbers.isEmpty(); }

  // Tells those that are registered now; one that is removed before its turn is left out.
  template <class Call>
  void tellAll(const Call& call) const {
    quint64 last = m_next;
    for (auto at = m_byNumber.constBegin(); at != m_byNumber.constEnd() && at.key() < last;) {
      const quint64 number = at.key();
      call(*at.value());
      at = m_byNumber.upperBound(number);
    }
  }

 private:
  QMap<quint64, CompoundTransformerNetworkListener*> m_byNumber;
  QHash<CompoundTransformerNetworkListener*, quint64> m_numbers;
  quint64 m_next = 0;
};
