// What a question to custom transformers that stand inside each other may cost.
//
// The operations that it passes are fixed and have no place for what it has cost so far: the outermost call
// of a thread begins the count, those further in go on with it. An answer that would cost more is not whole;
// whoever has to know keeps an OverrunListener while asking.
#pragma once

#include <platform/Export.h>

#include <QtGlobal>

class NestedQuestion {
 public:
  enum class Kind { Attributes, Value, Body };

  explicit NestedQuestion(Kind kind);
  ~NestedQuestion();
  NestedQuestion(const NestedQuestion&) = delete;
  NestedQuestion& operator=(const NestedQuestion&) = delete;

  // How many of the kind are on their way.
  static int depth(Kind kind);
  // Tells outermost questions apart.
  static quint64 number(Kind kind);
  // False, which is told, when the question has cost more than `most`.
  static bool spend(Kind kind, qint64 cost, qint64 most);

 private:
  const Kind m_kind;
};

// Listeners are each thread's own, and the innermost one hears.
class ORX_EXPORT OverrunListener {
 public:
  OverrunListener();
  ~OverrunListener();
  OverrunListener(const OverrunListener&) = delete;
  OverrunListener& operator=(const OverrunListener&) = delete;

  bool hasHeard() const { return m_hasHeard; }

 private:
  friend class NestedQuestion;

  OverrunListener* const m_outer;
  bool m_hasHeard = false;
};
