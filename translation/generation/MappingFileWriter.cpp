#include <transform/core/TransformerCfg.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/scripts/ScriptBlocks.h>
#include <transform/text/MFBuffer.h>
#include <transform/text/MappingFileKeywords.h>
#include <transform/text/TextHelpers.h>
#include <translation/ProgramVersion.h>
#include <translation/generation/CustomDefinitions.h>
#include <translation/generation/MappingFileWriter.h>
#include <translation/generation/RouteStatement.h>
#include <translation/generation/WorkspaceConnection.h>
#include <translation/graph/StatementNames.h>
#include <translation/mappingfile/HarmlessText.h>
#include <translation/mappingfile/WrittenCheck.h>

#include <QSet>

#include <algorithm>

using orx::Rule;

namespace {

std::size_t at(int number) {
  return static_cast<std::size_t>(number);
}

void writeStatement(MFBuffer& buffer, const QString& line) {
  buffer.add(line);
  buffer.flush();
}

}  // namespace

bool MappingFileWriter::write(MFBuffer& buffer, WrittenCheck* check) {
  writeStatement(buffer, QLatin1String("# Written by ") + programVersion());
  writeHeader(buffer, check);
  writeParameters(buffer, check);
  WrittenCheck* const ofNames = check && hasHarmfulNames() ? check : nullptr;
  if (check && !ofNames)
    check->skip();
  writeFeatureTypes(buffer, ofNames);
  m_definitions.write(buffer, check);
  const bool isWritten = writeTransformers(buffer, check, ofNames != nullptr);
  writeWriterRoutes(buffer, ofNames);
  return isWritten;
}

bool MappingFileWriter::hasHarmfulNames() const {
  const auto areHarmless = [](const QStringList& names) {
    return std::all_of(names.begin(), names.end(), isHarmlessText);
  };
  return !std::all_of(m_workspace.nodes.begin(), m_workspace.nodes.end(),
                      [&](const WorkspaceNode& node) {
                        return isHarmlessText(node.name) && !StatementNames::isUnusual(node.name) &&
                               isHarmlessText(node.keyword) && areHarmless(node.attributes) &&
                               std::all_of(node.exposed.begin(), node.exposed.end(), areHarmless);
                      }) ||
         !std::all_of(m_workspace.attributeLinks.begin(), m_workspace.attributeLinks.end(),
                      [&](const AttributeLink& link) {
                        return areHarmless({link.from, link.to});
                      }) ||
         // Factories of the header may bear the names of ours.
         std::any_of(m_workspace.headerLines.begin(), m_workspace.headerLines.end(),
                     [](const QString& line) { return line.contains(kFactoryStatement); });
}

void MappingFileWriter::writeHeader(MFBuffer& buffer, WrittenCheck* check) const {
  if (m_workspace.headerLines.isEmpty())
    return;
  int number = m_workspace.firstHeaderLine;
  for (const QString& line : m_workspace.headerLines) {
    if (check)
      check->begin({WrittenPlace::Kind::HeaderLine, number, QString()});
    buffer.write(line.toUtf8() + '\n');
    ++number;
  }
  buffer.write(QByteArray(1, '\n'));
}

// Only what is suspect is judged: what has a value of its own that may do harm, custom transformers, and the
// first of each kind, whose template and defaults stand for those of all.
bool MappingFileWriter::writeTransformers(MFBuffer& buffer, WrittenCheck* check, bool judgesAll) {
  QSet<const ConfiguredDefinition*> seen;
  bool isWritten = true;
  for (const int number : m_connection.order()) {
    const WorkspaceNode& node = m_workspace.nodes[at(number)];
    if (check) {
      const bool isFirst = !seen.contains(node.cfg->definition());
      seen.insert(node.cfg->definition());
      if (judgesAll || isFirst || !node.isHarmless || isCustomTransformer(node.cfg.get()))
        check->begin({WrittenPlace::Kind::Node, node.line, node.name, node.cfg.get(), &node.parameterLines});
      else
        check->skip();
    }
    if (node.cfg->instantiate(buffer, m_workspace.fileName)) {
      writeCopies(buffer, number);
      continue;
    }
    m_findings.report(Rule::NotWritten, node.line, node.name, {node.name});
    isWritten = false;
  }
  if (check)
    check->skip();
  return isWritten;
}

void MappingFileWriter::writeCopies(MFBuffer& buffer, int node) const {
  for (const auto& [flow, route] : m_connection.copiesFrom(node))
    ::writeCopies(buffer, flow, route.flow, route.function);
}

void MappingFileWriter::writeParameters(MFBuffer& buffer, WrittenCheck* check) const {
  for (const GlobalParameters::Parameter& parameter : m_workspace.parameters.all()) {
    const QString name = parameter.name + QLatin1Char(' ');
    if (check)
      check->begin({WrittenPlace::Kind::Parameter, parameter.line, parameter.name});
    QStringList script;
    if (parameter.isComputed() && parameter.language == ScriptLanguage::Python)
      getPythonParameterLines(QString(), parameter.name, parameter.value, script);
    else if (parameter.isComputed())
      getTclParameterLines(QString(), parameter.name, parameter.value, script);
    for (const QString& line : qAsConst(script))
      writeStatement(buffer, line);
    if (!parameter.setInHeader && parameter.language == ScriptLanguage::None)
      writeStatement(buffer, kDefaultMacroStatement + name + parameter.value);
    if (parameter.isOverridden)
      writeStatement(buffer, kMacroStatement + name + parameter.overridingValue);
  }
}

void MappingFileWriter::writeFeatureTypes(MFBuffer& buffer, WrittenCheck* check) const {
  for (int node = 0; node < static_cast<int>(m_workspace.nodes.size()); ++node) {
    const WorkspaceNode& place = m_workspace.nodes[at(node)];
    if (place.isTransformer())
      continue;
    if (check)
      check->begin({WrittenPlace::Kind::Node, place.line, place.name});
    const QString flow = m_connection.flowOfType(node);
    if (flow != place.name) {
      const bool isReader = place.kind == WorkspaceNode::Kind::Reader;
      const QString type = quotifyStringForMF(place.name);
      const QString shownFlow = quotifyStringForMF(flow);
      writeStatement(
          buffer, (isReader ? kReaderTypeStatement : kWriterTypeStatement) + QLatin1Char(' ') +
                      quotifyStringForMF(place.keyword) + QLatin1Char(' ') +
                      (isReader ? type + QLatin1Char(' ') + shownFlow : shownFlow + QLatin1Char(' ') + type));
    }
  }
  // Factories stand behind all types.
  for (int node = 0; node < static_cast<int>(m_workspace.nodes.size()); ++node) {
    const WorkspaceNode& place = m_workspace.nodes[at(node)];
    if (place.kind != WorkspaceNode::Kind::Reader)
      continue;
    if (check)
      check->begin({WrittenPlace::Kind::Node, place.line, place.name});
    writeCopies(buffer, node);
  }
}

void MappingFileWriter::writeWriterRoutes(MFBuffer& buffer, WrittenCheck* check) const {
  for (int node = 0; node < static_cast<int>(m_workspace.nodes.size()); ++node) {
    const WorkspaceNode& place = m_workspace.nodes[at(node)];
    if (place.kind != WorkspaceNode::Kind::Writer || m_connection.incoming(node).empty())
      continue;
    if (check)
      check->begin({WrittenPlace::Kind::Node, place.line, place.name});
    QStringList flows;
    for (const int number : m_connection.incoming(node)) {
      const WorkspaceLink& link = m_workspace.links[at(number)];
      flows.append(m_connection.flowOf(link));
    }
    writeRoute(buffer, writerRouteName(place), flows, m_connection.flowOfType(node), {});
  }
}
