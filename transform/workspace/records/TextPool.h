// Short texts that come again and again, such as names and flags, share one copy.
#pragma once

#include <QString>
#include <QStringView>

#include <vector>

class TextPool {
 public:
  // The text, sharing the copy of an equal one that was asked for lately.
  QString shared(QStringView text) {
    if (text.isEmpty())
      return QLatin1String("");
    if (text.size() > kLongest)
      return text.toString();
    if (m_recent.empty())
      m_recent.resize(kRecent);
    QString& slot = m_recent[place(text)];
    if (slot != text)
      slot = text.toString();
    return slot;
  }

 private:
  static constexpr int kLongest = 40;
  static constexpr std::size_t kRecent = 2048;

  static std::size_t place(QStringView text) {
    quint32 hash = 2166136261U;
    for (const QChar unit : text)
      hash = (hash ^ unit.unicode()) * 16777619U;
    return (hash ^ hash >> 15U) % kRecent;
  }

  std::vector<QString> m_recent;
};
