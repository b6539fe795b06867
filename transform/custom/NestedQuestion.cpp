#include <transform/custom/NestedQuestion.h>

namespace {

struct Count {
  int depth = 0;
  quint64 number = 0;
  qint64 cost = 0;
};

thread_local Count counts[3];
thread_local OverrunListener* innermost = nullptr;

Count& countOf(NestedQuestion::Kind kind) {
  return counts[static_cast<int>(kind)];
}

}  // namespace

NestedQuestion::NestedQuestion(Kind kind) : m_kind(kind) {
  Count& count = countOf(kind);
  if (count.depth++ == 0) {
    ++count.number;
    count.cost = 0;
  }
}

NestedQuestion::~NestedQuestion() {
  --countOf(m_kind).depth;
}

int NestedQuestion::depth(Kind kind) {
  return countOf(kind).depth;
}

quint64 NestedQuestion::number(Kind kind) {
  return countOf(kind).number;
}

bool NestedQuestion::spend(Kind kind, qint64 cost, qint64 most) {
  const bool isWhole = (countOf(kind).cost += cost) <= most;
  if (!isWhole && innermost)
    innermost->m_hasHeard = true;
  return isWhole;
}

OverrunListener::OverrunListener() : m_outer(innermost) {
  innermost = this;
}

OverrunListener::~OverrunListener() {
  innermost = m_outer;
}
