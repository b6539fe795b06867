#include <transform/text/MessageNumbers.h>
#include <transform/workspace/WorkspaceLossReport.h>
#include <transform/workspace/reading/DocumentMessages.h>
#include <transform/workspace/reading/XORXDOMParser.h>
#include <transform/workspace/records/ElementTable.h>
#include <transform/workspace/writing/LossCollector.h>

namespace messages = orx::messages;

namespace {

WorkspaceLossReport::Kind kindOf(LeftOutContent::Kind content) {
  switch (content) {
    case LeftOutContent::Kind::Comment:
      return WorkspaceLossReport::Kind::Comment;
    case LeftOutContent::Kind::Instruction:
      return WorkspaceLossReport::Kind::Instruction;
    case LeftOutContent::Kind::Declaration:
      return WorkspaceLossReport::Kind::Declaration;
    case LeftOutContent::Kind::Text:
      break;
  }
  return WorkspaceLossReport::Kind::Text;
}

}  // namespace

WorkspaceLossReport::WorkspaceLossReport(const XMLComponentReader& reader) {
  if (reader.getElements().size() > 0)
    LossCollector(reader.getElements(), m_losses).document(0);
  for (const LeftOutContent& entry : reader.getLeftOutContent())
    m_losses.push_back({kindOf(entry.kind), entry.line, QString(), QString(), QString()});
  std::stable_sort(m_losses.begin(), m_losses.end(),
                   [](const Loss& left, const Loss& right) { return left.line < right.line; });
}

QString WorkspaceLossReport::Loss::describe() const {
  switch (kind) {
    case Kind::Root:
      return documentText(messages::kLostRoot, {element, words::kWorkspace.toQString()});
    case Kind::Constant:
      return documentText(messages::kLostConstant, {element});
    case Kind::ReadOnlyAttribute:
      return documentText(messages::kReadOnlyAttribute, {attribute, element});
    case Kind::UnknownAttribute:
      return documentText(messages::kUnknownAttribute, {attribute, element});
    case Kind::MalformedValue:
      return documentText(messages::kMalformedValue, {attribute, element, value});
    case Kind::UnknownElement:
      return documentText(messages::kUnknownElement, {element});
    case Kind::RepeatedElement:
      return documentText(messages::kRepeatedElement, {element});
    case Kind::SubDocument:
      return attribute.isEmpty() ? documentText(messages::kNamelessSubDocument)
                                 : documentText(messages::kRepeatedSubDocument, {attribute});
    case Kind::Text:
      return documentText(messages::kLostText);
    case Kind::Comment:
      return documentText(messages::kLostComment);
    case Kind::Instruction:
      return documentText(messages::kLostInstruction);
    case Kind::Declaration:
      return documentText(messages::kLostDeclaration);
    case Kind::ChangedValue:
      return documentText(messages::kChangedValue, {attribute, element, value});
    case Kind::RawLine:
      return documentText(messages::kMovedLine, {value});
  }
  return QString();
}
