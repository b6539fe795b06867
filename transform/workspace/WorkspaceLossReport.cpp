#include <transform/workspace/DocumentMessages.h>
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
  using namespace document_messages;
  switch (kind) {
    case Kind::Root:
      return documentText(kLostRoot, {element, words::kWorkspace.toQString()});
    case Kind::Constant:
      return documentText(kLostConstant, {element});
    case Kind::ReadOnlyAttribute:
      return documentText(kReadOnlyAttribute, {attribute, element});
    case Kind::UnknownAttribute:
      return documentText(kUnknownAttribute, {attribute, element});
    case Kind::MalformedValue:
      return documentText(kMalformedValue, {attribute, element, value});
    case Kind::UnknownElement:
      return documentText(kUnknownElement, {element});
    case Kind::RepeatedElement:
      return documentText(kRepeatedElement, {element});
    case Kind::SubDocument:
      return attribute.isEmpty() ? documentText(kNamelessSubDocument)
                                 : documentText(kRepeatedSubDocument, {attribute});
    case Kind::Text:
      return documentText(kLostText);
    case Kind::Comment:
      return documentText(kLostComment);
    case Kind::Instruction:
      return documentText(kLostInstruction);
  }
  return QString();
}
