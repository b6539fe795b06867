#include <transform/core/ParameterReferences.h>
#include <transform/text/MacroText.h>

namespace {

bool counts(const MacroReference& reference) {
  return reference.isClosed && !reference.isDeferred && !reference.hasInner;
}

}  // namespace

QString replaceParameterReferences(const QString& text,
                                   const std::function<bool(const QString&, QString&)>& replace) {
  QString replaced;
  int copied = 0;
  for (const MacroReference& reference : macroReferences(text)) {
    QString replacement;
    if (!counts(reference) || !replace(reference.name(text), replacement))
      continue;
    replaced += text.midRef(copied, reference.begin - copied);
    replaced += replacement;
    copied = reference.end;
  }
  return copied == 0 ? text : replaced + text.midRef(copied);
}

bool anyParameterReference(const QString& text, const std::function<bool(const QString&)>& matches) {
  for (const MacroReference& reference : macroReferences(text)) {
    if (counts(reference) && matches(reference.name(text)))
      return true;
  }
  return false;
}
