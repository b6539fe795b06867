#include <platform/orxparameter/GUIType.h>
#include <transform/workspace/records/RecordReader.h>

namespace {

const QLatin1String kOldTypeAttribute("__KX_TYPE__");
const QLatin1String kTypeAttribute("orx_feature_type");

// A decimal index in braces anywhere makes the name indexed, unless "{}" leaves an index open.
AttributeListForm listForm(const QString& name) {
  AttributeListForm form = AttributeListForm::None;
  for (int open = name.indexOf(QLatin1Char('{')); open >= 0;
       open = name.indexOf(QLatin1Char('{'), open + 1)) {
    int close = open + 1;
    while (close < name.size() && name[close] >= QLatin1Char('0') && name[close] <= QLatin1Char('9'))
      ++close;
    if (close == name.size() || name[close] != QLatin1Char('}'))
      continue;
    if (close == open + 1)
      return AttributeListForm::IndexFree;
    form = AttributeListForm::Indexed;
  }
  return form;
}

}  // namespace

void RecordReader::finish(DatasetStruct& record) {
  if (record.role.isEmpty())
    record.role = (record.isSource ? words::kReader : words::kWriter).toQString();
}

void RecordReader::finish(XformAttrStruct& record) {
  record.listForm = listForm(record.attrName);
}

void RecordReader::finish(XformParmStruct& record) {
  if (record.parmName == words::kGroupBy.view())
    record.parmValue.replace(kOldTypeAttribute, kTypeAttribute);
}

void RecordReader::finish(TransformerStruct& record) const {
  for (const XformParmStruct& parameter : qAsConst(record.parameters)) {
    if (parameter.parmName == words::kXformerName.view()) {
      record.name = parameter.parmValue;
      break;
    }
  }
  if (record.type == words::kSubDocumentTransformer.view())
    record.kind = TransformerKind::SubDocument;
  else if (record.type == words::kInspector.view())
    record.kind = TransformerKind::Inspector;
  for (XformParmStruct& parameter : record.parameters) {
    if (parameter.customPrompt.isEmpty())
      continue;
    GUIType type;
    if (m_prompts)
      type = GUIType::fromGuiLine(m_prompts(record.type, record.version, parameter.parmName));
    if (type.isNull())
      type = GUIType::fromTransformerTypeString(QStringLiteral("OPTIONAL TEXT"), parameter.parmName);
    type.setDescription(parameter.customPrompt);
    parameter.promptLine = type.getAsString();
  }
}
