#include <transform/findings/Findings.h>
#include <transform/workspace/TransformerRecords.h>
#include <transform/workspace/WorkspaceRecords.h>
#include <translation/WorkspaceDocument.h>
#include <translation/validation/DocumentChecks.h>

#include <QHash>

using orx::Rule;

namespace {

void reportLoss(const WorkspaceLossReport::Loss& loss, orx::Findings& findings) {
  using Kind = WorkspaceLossReport::Kind;
  switch (loss.kind) {
    case Kind::MalformedValue:
      findings.report(Rule::MalformedValue, loss.line, QString(), {loss.attribute, loss.element, loss.value});
      break;
    case Kind::UnknownAttribute:
      findings.report(Rule::UnknownAttribute, loss.line, QString(), {loss.attribute, loss.element});
      break;
    case Kind::UnknownElement:
      findings.report(Rule::UnknownElement, loss.line, QString(), {loss.element});
      break;
    case Kind::RepeatedElement:
    case Kind::Text:
      findings.add(WorkspaceDocument::findingOf(loss));
      break;
    case Kind::RawLine:
      findings.report(Rule::StrayLine, loss.line, QString(), {loss.value});
      break;
    // These are told where the document is put together, or say nothing about its meaning.
    case Kind::Root:
    case Kind::Constant:
    case Kind::ReadOnlyAttribute:
    case Kind::ChangedValue:
    case Kind::SubDocument:
    case Kind::Comment:
    case Kind::Instruction:
    case Kind::Declaration:
      break;
  }
}

// The parameters that one node was given.
class GivenParameters {
 public:
  GivenParameters(const QString& node, orx::Findings& findings) : m_node(node), m_findings(findings) {}

  void add(const QString& name, const QString& value, int line) {
    const auto earlier = m_given.constFind(name);
    if (earlier == m_given.constEnd()) {
      m_given.insert(name, {value, line});
      return;
    }
    const bool isEqual = earlier->value == value;
    m_findings.report(isEqual ? Rule::RepeatedParameter : Rule::ContradictingParameter, line, m_node,
                      {name, QString::number(earlier->line)});
  }

 private:
  struct Given {
    QString value;
    int line = 0;
  };

  const QString& m_node;
  orx::Findings& m_findings;
  QHash<QString, Given> m_given;
};

void checkRepeats(const IXMLComponentReader& reader, orx::Findings& findings) {
  for (const DatasetStruct& dataset : reader.GetDatasetList()) {
    GivenParameters given(dataset.keyword, findings);
    for (const MetafileParameterStruct& parameter : dataset.metafileParameters)
      given.add(parameter.name, parameter.value, parameter.line);
  }
  for (const FeatureTypeStruct& type : reader.GetFeatureTypeList()) {
    GivenParameters given(type.nodeName, findings);
    for (const DeflineParmStruct& parameter : type.deflineParms)
      given.add(parameter.parmName, parameter.parmValue, parameter.line);
  }
  QStringList documents = QStringList(QString()) + reader.GetSubDocList();
  documents.removeDuplicates();
  for (const QString& document : qAsConst(documents)) {
    for (const TransformerStruct& transformer : reader.GetTransformerList(document)) {
      const QString title = transformerTitle(transformer);
      const QString node = document.isEmpty() ? title : document + QLatin1Char('/') + title;
      GivenParameters given(node, findings);
      for (const XformParmStruct& parameter : transformer.parameters)
        given.add(parameter.parmName, parameter.parmValue, parameter.line);
    }
  }
}

}  // namespace

void checkDocument(const WorkspaceDocument& document, orx::Findings& findings) {
  for (const WorkspaceLossReport::Loss& loss : document.losses())
    reportLoss(loss, findings);
  checkRepeats(document.reader(), findings);
}
