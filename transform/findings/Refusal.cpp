#include <transform/findings/Refusal.h>
#include <transform/text/MessageStrings.h>

namespace orx {

namespace {

thread_local RefusalListener* innermost = nullptr;

}  // namespace

RefusalListener::RefusalListener() : m_outer(innermost) {
  innermost = this;
}

RefusalListener::~RefusalListener() {
  innermost = m_outer;
}

bool refuse(QString& text, const Refusal& refusal, const QStringList& arguments) {
  text = TransformResString(refusal.message, arguments);
  if (innermost)
    innermost->m_refusal = refusal;
  return false;
}

bool refuse(QString& text, long message, const QStringList& arguments) {
  Refusal refusal;
  refusal.message = message;
  return refuse(text, refusal, arguments);
}

}  // namespace orx
