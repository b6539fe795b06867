#include "CustomFixtures.h"

QStringList names(const QString& text) {
  return text.isEmpty() ? QStringList() : text.split(QLatin1Char(','));
}

TransformerDefinition passing(const QString& type, const QString& outputs, const QString& added) {
  TransformerDefinition definition;
  definition.name = type;
  definition.version = 1;
  definition.featureHolding = 1;
  definition.inputTags = QStringList{QStringLiteral("IN")};
  definition.outputTags = names(outputs);
  definition.preservesAttributes = QStringList{QStringLiteral("<ALL>")};
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
    const QStringList words = line.split(QLatin1Char(' '));
    const QString& keyword = words.at(0);
    if (words.value(1) == QLatin1String("->")) {
      network.addLink(numbers.value(words.at(0), -1), QStringLiteral("OUT"), numbers.value(words.at(2), -1),
                      QStringLiteral("IN"));
      continue;
    }
    const QString name = words.at(1);
    const QString list = words.value(2);
    if (keyword == QLatin1String("in"))
      network.addInput(name, number, number);
    else if (keyword == QLatin1String("out"))
      network.addOutput(name, number, kOutgoingArriving, {}, number);
    else if (keyword == QLatin1String("own"))
      network.addOutput(name, number, kOutgoingOwnList, names(list), number);
    else if (keyword == QLatin1String("loop"))
      network.addLoop(name, number);
    else if (keyword == QLatin1String("use"))
      network.addTransformer(new CompoundTransformerCfg(inner), {}, number);
    else
      network.addTransformer(
          configured(passing(QStringLiteral("Adder"), QStringLiteral("OUT"), list), name).release(), {},
          number);
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
  for (QString line : text().split(QLatin1Char('\n'))) {
    if (line.endsWith(QLatin1Char('\\')))
      line.chop(1);
    while (line.endsWith(QLatin1Char(' ')))
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
  return QLatin1String("<XFORM_PARM") + attribute("PARM_NAME", name) + attribute("PARM_VALUE", value) +
         QLatin1String("/>");
}

}  // namespace

QByteArray documentXml(const std::vector<DocumentText>& documents) {
  QString xml =
      QStringLiteral("<?xml version=\"1.0\" encoding=\"UTF-8\" ?>\n<TRANSFORMER>\n<SUBDOCUMENTS>\n");
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
      const QStringList words = line.split(QLatin1Char(' '));
      const QString& keyword = words.at(0);
      const QString name = words.value(1);
      const QString rest = QStringList(words.mid(2)).join(QLatin1Char(' '));
      if (name == QLatin1String("->")) {
        links += QStringLiteral("<FEAT_LINK IDENTIFIER=\"%1\" SOURCE_NODE=\"%2\" TARGET_NODE=\"%3\"")
                     .arg(100 + number++)
                     .arg(numbers.value(words.at(0), 999))
                     .arg(numbers.value(words.at(2), 999)) +
                 attribute("SOURCE_PORT_DESC", QStringLiteral("fo 0 ") + words.value(3)) +
                 attribute("TARGET_PORT_DESC", QStringLiteral("fi 0 ") + words.value(4)) +
                 QLatin1String("/>\n");
        continue;
      }
      if (keyword == QLatin1String("raw")) {
        links += line.mid(4) + QLatin1Char('\n');
        continue;
      }
      if (keyword == QLatin1String("set")) {
        settings += attribute(qPrintable(name), rest);
        continue;
      }
      if (keyword == QLatin1String("gui")) {
        const QStringList parts = line.mid(4).split(QStringLiteral(" | "));
        parameters += QLatin1String("<GLOBAL_PARAMETER") + attribute("GUI_LINE", parts.at(0)) +
                      attribute("DEFAULT_VALUE", parts.value(1)) + QLatin1String("/>\n");
        continue;
      }
      if (keyword == QLatin1String("parm")) {
        bodies[name] += parameter(words.at(2), QStringList(words.mid(3)).join(QLatin1Char(' ')));
        continue;
      }
      numbers.insert(name, number);
      const bool isPort = keyword == QLatin1String("in") || keyword == QLatin1String("out") ||
                          keyword == QLatin1String("own") || keyword == QLatin1String("loop");
      if (isPort) {
        ports += QStringLiteral("<SUBDOCUMENT_IO IDENTIFIER=\"%1\"").arg(number) + attribute("NAME", name) +
                 attribute("IS_SOURCE", keyword == QLatin1String("in")     ? QStringLiteral("true")
                                        : keyword == QLatin1String("loop") ? QStringLiteral("loop")
                                                                           : QStringLiteral("false")) +
                 attribute("ATTR_MODE",
                           keyword == QLatin1String("own") ? QStringLiteral("1") : QStringLiteral("0")) +
                 QLatin1Char('>');
        for (const QString& listed : names(rest))
          ports += QLatin1String("<XFORM_ATTR") + attribute("ATTR_NAME", listed) + QLatin1String("/>");
        ports += QLatin1String("</SUBDOCUMENT_IO>\n");
      } else {
        const bool isNested = keyword == QLatin1String("use");
        const QString type = isNested ? QStringLiteral("SubDocumentTransformer") : rest;
        transformers.append(QStringLiteral("<TRANSFORMER IDENTIFIER=\"%1\" VERSION=\"1\"").arg(number) +
                            attribute("TYPE", type) + QLatin1Char('>') +
                            parameter(QStringLiteral("XFORMER_NAME"), name));
        bodies[name] += isNested ? parameter(QStringLiteral("SUB_DOC_NAME"), rest) : QString();
        transformers.last() += QLatin1Char('\x01') + name;
      }
      ++number;
    }
    xml += QLatin1String("<SUBDOCUMENT") + attribute("NAME", document.name) + settings + QLatin1String(">\n");
    xml += QLatin1String("<GLOBAL_PARAMETERS>\n") + parameters +
           QLatin1String("</GLOBAL_PARAMETERS>\n<TRANSFORMERS>\n");
    for (const QString& transformer : qAsConst(transformers)) {
      const int mark = transformer.indexOf(QLatin1Char('\x01'));
      xml += transformer.left(mark) + bodies.value(transformer.mid(mark + 1)) +
             QLatin1String("</TRANSFORMER>\n");
    }
    xml += QLatin1String("</TRANSFORMERS>\n<SUBDOCUMENT_IOS>\n") + ports +
           QLatin1String("</SUBDOCUMENT_IOS>\n<FEAT_LINKS>\n") + links +
           QLatin1String("</FEAT_LINKS>\n</SUBDOCUMENT>\n");
  }
  return (xml + QLatin1String("</SUBDOCUMENTS>\n</TRANSFORMER>\n")).toUtf8();
}
