#include <transform/workspace/LossCollector.h>
#include <transform/workspace/WorkspaceLossReport.h>

namespace {

WorkspaceLossReport::Kind kindOf(XORXDOMParser::Content content) {
  switch (content) {
    case XORXDOMParser::Content::Comment:
      return WorkspaceLossReport::Kind::Comment;
    case XORXDOMParser::Content::Instruction:
      return WorkspaceLossReport::Kind::Instruction;
    case XORXDOMParser::Content::Text:
      break;
  }
  return WorkspaceLossReport::Kind::Text;
}

}  // namespace

WorkspaceLossReport::WorkspaceLossReport(const XMLComponentReader& reader) {
  if (reader.getElements().size() > 0)
    LossCollector(reader.getElements(), m_losses).document(0);
  for (const XORXDOMParser::LeftOut& entry : reader.getLeftOutContent())
    m_losses.push_back({kindOf(entry.content), entry.line, QString(), QString(), QString()});
  std::stable_sort(m_losses.begin(), m_losses.end(),
                   [](const Loss& left, const Loss& right) { return left.line < right.line; });
}

QString WorkspaceLossReport::Loss::describe() const {
  switch (kind) {
    case Kind::Root:
      return QStringLiteral("the root element %1 would become %2")
          .arg(element, words::kWorkspace.toQString());
    case Kind::Constant:
      return QStringLiteral("the constant %1 is not written").arg(element);
    case Kind::ReadOnlyAttribute:
      return QStringLiteral("the attribute %1 of %2 is only read").arg(attribute, element);
    case Kind::UnknownAttribute:
      return QStringLiteral("the attribute %1 of %2 is not known").arg(attribute, element);
    case Kind::MalformedValue:
      return QStringLiteral("the attribute %1 of %2 has a malformed value: %3")
          .arg(attribute, element, value);
    case Kind::UnknownElement:
      return QStringLiteral("the element %1 is not known here").arg(element);
    case Kind::RepeatedElement:
      return QStringLiteral("the element %1 is repeated").arg(element);
    case Kind::SubDocument:
      return attribute.isEmpty()
                 ? QStringLiteral("a sub-document has no name")
                 : QStringLiteral("there is an earlier sub-document of the name %1").arg(attribute);
    case Kind::Text:
      return QStringLiteral("text is not kept");
    case Kind::Comment:
      return QStringLiteral("a comment is not kept");
    case Kind::Instruction:
      return QStringLiteral("a processing instruction is not kept");
  }
  return QString();
}
