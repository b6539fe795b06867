// What a validation tells beside the text of its refusal.
//
// The signatures of the validations carry a text alone. Whoever wants more keeps a RefusalListener while a
// validation runs; without one nothing is kept. Listeners are each thread's own, and the innermost one hears.
#pragma once

#include <platform/Export.h>
#include <transform/findings/Rules.h>

#include <QString>
#include <QStringList>

namespace orx {

struct Refusal {
  Rule rule = Rule::InvalidValue;
  long message = 0;             // number of the text; 0 when none was told
  bool namesParameter = false;  // the text names the parameter, which need not be put in front of it
};

class ORX_EXPORT RefusalListener {
 public:
  RefusalListener();
  ~RefusalListener();
  RefusalListener(const RefusalListener&) = delete;
  RefusalListener& operator=(const RefusalListener&) = delete;

  // The last one that was told; as it begins when none was.
  const Refusal& refusal() const { return m_refusal; }

 private:
  friend ORX_EXPORT bool refuse(QString& text, const Refusal& refusal, const QStringList& arguments);

  RefusalListener* const m_outer;
  Refusal m_refusal;
};

// Puts the message into `text` and tells it. Always false, so that a validation can answer with it.
ORX_EXPORT bool refuse(QString& text, const Refusal& refusal, const QStringList& arguments = QStringList());
// With the rule for values that a transformer refuses for a reason of its own.
ORX_EXPORT bool refuse(QString& text, long message, const QStringList& arguments = QStringList());

}  // namespace orx
