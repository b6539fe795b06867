#include "CustomFixtures.h"

QStringList names(const QString& text) {
  return text.isEmpty() ? QStringList() : text.split(',');
}

TransformerDefinition passing(const QString& type, const QString& outputs, const QString& added) {
  TransformerDefinition definition;
  definition.name = type;
  definition.version = 1;
  definition.featureHolding = 1;
  definition.inputTags = QStringList{"IN"};
  definition.outputTags = names(outputs);
  definition.preservesAttributes = QStringList{"<ALL>"};
  definition.attributesAdded = names(added);
  return definition;
}

std::unique_ptr<TransformerCfg> configured(const TransformerDefinition& definition,
                                           const QString& identifier) {
  auto cfg = std::make_unique<TransformerCfg>();
  cfg->configure(definition);
  cfg->setIdentifier(identifier.isEmpty() ? definition.name : identifier);
  return cfg;
}

void Definitions::add(const TransformerDefinition& definition) {
  m_definitions.insert(definition.name, definition);
}

std::unique_ptr<TransformerCfg> Definitions::makeTransformer(const QString& name, int version, QString*) {
  const auto at = m_definitions.constFind(name);
  if (at == m_definitions.constEnd() || (version >= 0 && version != at->version))
    return nullptr;
  return configured(*at);
}

OpenNetwork::OpenNetwork(const QString& name, int version) {
  setName(name);
  setVersion(version);
}

void OpenNetwork::publish(const QString& guiLine, const QString& value) {
  const GUIType type = GUIType::fromGuiLine(guiLine);
  addPublishedParameter(type, type.getName());
  addPublishedParameter(type.getName(), value);
}

QStringList OpenNetwork::attributesOf(const QString& output) const {
  QHash<QString, QString> origins;
  return getOutputAttributes(output, origins);
}

void assemble(OpenNetwork& network, const QStringList& lines, CompoundTransformerNetwork* inner) {
  QHash<QString, int> numbers;
  int number = 0;
  for (const QString& line : lines) {
    const QStringList words = line.split(' ');
    const QString& keyword = words.at(0);
    if (words.value(1) == "->") {
      network.addLink(numbers.value(words.at(0), -1), "OUT", numbers.value(words.at(2), -1), "IN");
      continue;
    }
    const QString name = words.at(1);
    const QString list = words.value(2);
    if (keyword == "in")
      network.addInput(name, number, number);
    else if (keyword == "out")
      network.addOutput(name, number, kOutgoingArriving, {}, number);
    else if (keyword == "own")
      network.addOutput(name, number, kOutgoingOwnList, names(list), number);
    else if (keyword == "loop")
      network.addLoop(name, number);
    else if (keyword == "use")
      network.addTransformer(new CompoundTransformerCfg(inner), {}, number);
    else
      network.addTransformer(configured(passing("Adder", "OUT", list), name).release(), {}, number);
    numbers.insert(name, number++);
  }
  network.doneAdding(true);
}

namespace {

// An element with attributes given as name, value, name, value.
QString element(const QString& name, const QStringList& attributes, const QString& inner = QString()) {
  QString text = '<' + name;
  for (int i = 0; i + 1 < attributes.size(); i += 2)
    text += ' ' + attributes.at(i) + "=\"" + attributes.at(i + 1).toHtmlEscaped() + '"';
  return text + '>' + inner + "</" + name + ">\n";
}

QString parameter(const QString& name, const QString& value) {
  return element("XFORM_PARM", {"PARM_NAME", name, "PARM_VALUE", value});
}

}  // namespace

QByteArray documentXml(const std::vector<DocumentText>& documents) {
  QString all;
  for (const DocumentText& document : documents) {
    QStringList settings{"NAME", document.name};
    QString parameters, transformers, ports, links;
    QHash<QString, QString> values;
    QHash<QString, int> numbers;
    int count = 0;
    for (const QString& line : document.lines.filter("parm ")) {
      const QStringList words = line.split(' ');
      values[words.value(1)] += parameter(words.value(2), QStringList(words.mid(3)).join(' '));
    }
    for (const QString& line : document.lines) {
      const QStringList words = line.split(' ');
      const QString& keyword = words.at(0);
      const QString name = words.value(1);
      const QString rest = QStringList(words.mid(2)).join(' ');
      const QString number = QString::number(count);
      if (name == "->") {
        links +=
            element("FEAT_LINK", {"IDENTIFIER", QString::number(100 + links.size()), "SOURCE_NODE",
                                  QString::number(numbers.value(keyword, 999)), "TARGET_NODE",
                                  QString::number(numbers.value(words.at(2), 999)), "SOURCE_PORT_DESC",
                                  "fo 0 " + words.value(3), "TARGET_PORT_DESC", "fi 0 " + words.value(4)});
      } else if (keyword == "raw") {
        links += line.mid(4) + '\n';
      } else if (keyword == "set") {
        settings << name << rest;
      } else if (keyword == "gui") {
        const QStringList parts = line.mid(4).split(" | ");
        parameters += element("GLOBAL_PARAMETER", {"GUI_LINE", parts.at(0), "DEFAULT_VALUE", parts.value(1)});
      } else if (keyword == "t" || keyword == "use") {
        const bool isNested = keyword == "use";
        transformers += element(
            "TRANSFORMER",
            {"IDENTIFIER", number, "VERSION", "1", "TYPE", isNested ? "SubDocumentTransformer" : rest},
            parameter("XFORMER_NAME", name) + (isNested ? parameter("SUB_DOC_NAME", rest) : "") +
                values.value(name));
        numbers.insert(name, count++);
      } else if (keyword != "parm") {
        QString listed;
        for (const QString& attribute : names(rest))
          listed += element("XFORM_ATTR", {"ATTR_NAME", attribute});
        ports += element("SUBDOCUMENT_IO",
                         {"IDENTIFIER", number, "NAME", name, "IS_SOURCE",
                          keyword == "in"     ? "true"
                          : keyword == "loop" ? "loop"
                                              : "false",
                          "ATTR_MODE", keyword == "own" ? "1" : "0"},
                         listed);
        numbers.insert(name, count++);
      }
    }
    all += element("SUBDOCUMENT", settings,
                   element("GLOBAL_PARAMETERS", {}, parameters) + element("TRANSFORMERS", {}, transformers) +
                       element("SUBDOCUMENT_IOS", {}, ports) + element("FEAT_LINKS", {}, links));
  }
  return ("<?xml version=\"1.0\" encoding=\"UTF-8\" ?>\n" +
          element("TRANSFORMER", {}, element("SUBDOCUMENTS", {}, all)))
      .toUtf8();
}
