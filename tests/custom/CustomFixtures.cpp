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

std::unique_ptr<TransformerCfg> Definitions::makeTransformer(const QString& name, int version) {
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

TextBuffer::TextBuffer() {
  m_device.open(QIODevice::ReadWrite);
  setDevice(&m_device);
}

TextBuffer::~TextBuffer() {
  setDevice(nullptr);
}

void TextBuffer::write(const QByteArray& bytes) {
  m_device.write(bytes);
}

QString TextBuffer::text() const {
  return QString::fromUtf8(m_device.data());
}

QStringList TextBuffer::lines() const {
  QStringList kept;
  for (QString line : text().split('\n')) {
    if (line.endsWith('\\'))
      line.chop(1);
    while (line.endsWith(' '))
      line.chop(1);
    if (!line.isEmpty())
      kept.append(line);
  }
  return kept;
}

namespace {

QString attribute(const char* name, const QString& value) {
  return QStringLiteral(" %1=\"%2\"").arg(QLatin1String(name), value.toHtmlEscaped());
}

QString parameter(const QString& name, const QString& value) {
  return QLatin1String("<XFORM_PARM") + attribute("PARM_NAME", name) + attribute("PARM_VALUE", value) + "/>";
}

}  // namespace

QByteArray documentXml(const std::vector<DocumentText>& documents) {
  QString xml = "<?xml version=\"1.0\" encoding=\"UTF-8\" ?>\n<TRANSFORMER>\n<SUBDOCUMENTS>\n";
  for (const DocumentText& document : documents) {
    QString settings;
    QString parameters;
    QString ports;
    QString links;
    QStringList transformers;
    QHash<QString, QString> bodies;
    QHash<QString, int> numbers;
    int number = 0;
    for (const QString& line : document.lines) {
      const QStringList words = line.split(' ');
      const QString& keyword = words.at(0);
      const QString name = words.value(1);
      const QString rest = QStringList(words.mid(2)).join(' ');
      if (name == "->") {
        links += QStringLiteral("<FEAT_LINK IDENTIFIER=\"%1\" SOURCE_NODE=\"%2\" TARGET_NODE=\"%3\"")
                     .arg(100 + number++)
                     .arg(numbers.value(words.at(0), 999))
                     .arg(numbers.value(words.at(2), 999)) +
                 attribute("SOURCE_PORT_DESC", QStringLiteral("fo 0 ") + words.value(3)) +
                 attribute("TARGET_PORT_DESC", QStringLiteral("fi 0 ") + words.value(4)) + "/>\n";
        continue;
      }
      if (keyword == "raw") {
        links += line.mid(4) + '\n';
        continue;
      }
      if (keyword == "set") {
        settings += attribute(qPrintable(name), rest);
        continue;
      }
      if (keyword == "gui") {
        const QStringList parts = line.mid(4).split(" | ");
        parameters += QLatin1String("<GLOBAL_PARAMETER") + attribute("GUI_LINE", parts.at(0)) +
                      attribute("DEFAULT_VALUE", parts.value(1)) + "/>\n";
        continue;
      }
      if (keyword == "parm") {
        bodies[name] += parameter(words.at(2), QStringList(words.mid(3)).join(' '));
        continue;
      }
      numbers.insert(name, number);
      const bool isPort = keyword == "in" || keyword == "out" || keyword == "own" || keyword == "loop";
      if (isPort) {
        ports += QStringLiteral("<SUBDOCUMENT_IO IDENTIFIER=\"%1\"").arg(number) + attribute("NAME", name) +
                 attribute("IS_SOURCE", keyword == "in"     ? "true"
                                        : keyword == "loop" ? "loop"
                                                            : "false") +
                 attribute("ATTR_MODE", keyword == "own" ? "1" : "0") + '>';
        for (const QString& listed : names(rest))
          ports += QLatin1String("<XFORM_ATTR") + attribute("ATTR_NAME", listed) + "/>";
        ports += "</SUBDOCUMENT_IO>\n";
      } else {
        const bool isNested = keyword == "use";
        const QString type = isNested ? "SubDocumentTransformer" : rest;
        transformers.append(QStringLiteral("<TRANSFORMER IDENTIFIER=\"%1\" VERSION=\"1\"").arg(number) +
                            attribute("TYPE", type) + QLatin1Char('>') + parameter("XFORMER_NAME", name));
        bodies[name] += isNested ? parameter("SUB_DOC_NAME", rest) : QString();
        transformers.last() += QLatin1Char('\x01') + name;
      }
      ++number;
    }
    xml += QLatin1String("<SUBDOCUMENT") + attribute("NAME", document.name) + settings + ">\n";
    xml += QLatin1String("<GLOBAL_PARAMETERS>\n") + parameters + "</GLOBAL_PARAMETERS>\n<TRANSFORMERS>\n";
    for (const QString& transformer : qAsConst(transformers)) {
      const int mark = transformer.indexOf(QLatin1Char('\x01'));
      xml += transformer.left(mark) + bodies.value(transformer.mid(mark + 1)) + "</TRANSFORMER>\n";
    }
    xml += QLatin1String("</TRANSFORMERS>\n<SUBDOCUMENT_IOS>\n") + ports +
           QLatin1String("</SUBDOCUMENT_IOS>\n<FEAT_LINKS>\n") + links + "</FEAT_LINKS>\n</SUBDOCUMENT>\n";
  }
  return (xml + "</SUBDOCUMENTS>\n</TRANSFORMER>\n").toUtf8();
}
