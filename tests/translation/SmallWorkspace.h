// Small workspaces for tests: a document put together element by element, and transformers that need no
// files.
#pragma once

#include <tests/support/Files.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerDefinition.h>
#include <transform/core/TransformerSource.h>

#include <QString>
#include <QStringList>
#include <QTemporaryDir>

class SmallWorkspace {
 public:
  SmallWorkspace& header(const QString& line) {
    m_header += line + "\n";
    return *this;
  }
  SmallWorkspace& parameter(const QString& guiLine, const QString& value) {
    m_parameters += element("GLOBAL_PARAMETER", {"GUI_LINE", guiLine, "DEFAULT_VALUE", value});
    return *this;
  }
  SmallWorkspace& reader(int id, const QString& name, const QStringList& attributes = {}) {
    return featureType(id, name, "true", attributes);
  }
  SmallWorkspace& writer(int id, const QString& name) { return featureType(id, name, "false", {}); }
  // `parameters` are name, value, name, value; `extra` are further attributes of the element.
  SmallWorkspace& transformer(int id, const QString& type, const QStringList& parameters,
                              const QStringList& extra = {}, const QString& children = QString()) {
    QString inner = children;
    for (int i = 0; i + 1 < parameters.size(); i += 2)
      inner += element("XFORM_PARM", {"PARM_NAME", parameters.at(i), "PARM_VALUE", parameters.at(i + 1)});
    m_transformers +=
        element("TRANSFORMER", QStringList{"IDENTIFIER", QString::number(id), "TYPE", type} + extra, inner);
    return *this;
  }
  SmallWorkspace& link(int from, const QString& output, int to, const QString& input,
                       const QStringList& extra = {}) {
    m_links += element("FEAT_LINK", QStringList{"IDENTIFIER", QString::number(++m_linkCount), "SOURCE_NODE",
                                                QString::number(from), "TARGET_NODE", QString::number(to),
                                                "SOURCE_PORT_DESC", output, "TARGET_PORT_DESC", input} +
                                        extra);
    return *this;
  }
  SmallWorkspace& attributeLink(int from, const QString& output, int to, const QString& input) {
    m_attributeLinks +=
        element("ATTR_LINK", {"IDENTIFIER", "900", "SOURCE_NODE", QString::number(from), "TARGET_NODE",
                              QString::number(to), "SOURCE_PORT_DESC", output, "TARGET_PORT_DESC", input});
    return *this;
  }

  // Everything added behind this stands in a sub-document of that name; `settings` are further attributes.
  SmallWorkspace& beginCustom(const QString& name, const QStringList& settings = {}) {
    m_main = QStringList{m_parameters, m_transformers, m_links, m_attributeLinks};
    m_parameters = m_transformers = m_links = m_attributeLinks = m_ports = QString();
    m_customName = name;
    m_customSettings = settings;
    return *this;
  }
  // A further attribute of the sub-document that was begun.
  SmallWorkspace& setting(const QString& name, const QString& value) {
    m_customSettings += {name, value};
    return *this;
  }
  // `kind` is "true" for an input, "false" for an output, "loop" for a loop point.
  SmallWorkspace& port(int id, const QString& name, const QString& kind) {
    m_ports +=
        element("SUBDOCUMENT_IO", {"IDENTIFIER", QString::number(id), "NAME", name, "IS_SOURCE", kind});
    return *this;
  }
  SmallWorkspace& endCustom() {
    m_subDocuments +=
        element("SUBDOCUMENT", QStringList{"NAME", m_customName} + m_customSettings, sections());
    m_parameters = m_main.at(0);
    m_transformers = m_main.at(1);
    m_links = m_main.at(2);
    m_attributeLinks = m_main.at(3);
    m_ports = QString();
    return *this;
  }

  QString text() const {
    const QString xml = "<?xml version=\"1.0\" encoding=\"UTF-8\" ?>\n<WORKSPACE>\n<FEATURE_TYPES>\n" +
                        m_featureTypes + "</FEATURE_TYPES>\n" + sections() + "<SUBDOCUMENTS>\n" +
                        m_subDocuments + "</SUBDOCUMENTS>\n</WORKSPACE>\n";
    QString result;
    for (const QString& line : xml.split('\n', Qt::SkipEmptyParts))
      result += "#! " + line + "\n";
    return result + "#! START_HEADER\n" + m_header + "#! END_HEADER\n";
  }
  QString save(const QTemporaryDir& folder, const QString& name = "test.orw") const {
    const QString path = folder.filePath(name);
    put(path, text().toUtf8());
    return path;
  }

 private:
  static QString element(const QString& name, const QStringList& attributes,
                         const QString& inner = QString()) {
    QString result = "<" + name;
    for (int i = 0; i + 1 < attributes.size(); i += 2)
      result +=
          " " + attributes.at(i) + "=\"" + attributes.at(i + 1).toHtmlEscaped().replace("\n", "&#10;") + "\"";
    return inner.isEmpty() ? result + "/>\n" : result + ">\n" + inner + "</" + name + ">\n";
  }
  QString sections() const {
    return "<GLOBAL_PARAMETERS>\n" + m_parameters + "</GLOBAL_PARAMETERS>\n<TRANSFORMERS>\n" +
           m_transformers + "</TRANSFORMERS>\n<SUBDOCUMENT_IOS>\n" + m_ports +
           "</SUBDOCUMENT_IOS>\n<FEAT_LINKS>\n" + m_links + "</FEAT_LINKS>\n<ATTR_LINKS>\n" +
           m_attributeLinks + "</ATTR_LINKS>\n";
  }
  SmallWorkspace& featureType(int id, const QString& name, const QString& isSource,
                              const QStringList& attributes) {
    QString inner;
    for (const QString& attribute : attributes)
      inner += element("FEAT_ATTRIBUTE", {"ATTR_NAME", attribute});
    m_featureTypes += element("FEATURE_TYPE",
                              {"IS_SOURCE", isSource, "FEATURE_TYPE_NAME", name, "IDENTIFIER",
                               QString::number(id), "KEYWORD", "DATA"},
                              inner);
    return *this;
  }

  QString m_header;
  QString m_parameters;
  QString m_featureTypes;
  QString m_transformers;
  QString m_links;
  QString m_attributeLinks;
  QString m_ports;
  QString m_subDocuments;
  QString m_customName;
  QStringList m_customSettings;
  QStringList m_main;
  int m_linkCount = 0;
};

// Makes the transformers "Copy" (INPUT to OUTPUT, REST), "Add" (the same, with a new attribute), "Join"
// (LEFT, RIGHT to OUTPUT), "Pick" (a lookup choice), "Map" (a choice with a lookup table) and "Broken" (a
// template that cannot be written).
class SmallSource : public TransformerSource {
 public:
  std::unique_ptr<TransformerCfg> makeTransformer(const QString& name, int version, QString*) override {
    TransformerDefinition definition;
    definition.name = name;
    definition.version = 1;
    if (version != 1 && version != 0 && version != kNewestVersion)
      return nullptr;
    definition.preservesAttributes = QStringList{"<ALL>"};
    definition.inputTags = QStringList{"INPUT"};
    definition.outputTags = QStringList{"OUTPUT", "REST"};
    QString parameter = "VALUE";
    QString type = "OPTIONAL TEXT";
    if (name == "Join") {
      definition.inputTags = QStringList{"LEFT", "RIGHT:R"};
      definition.outputTags = QStringList{"OUTPUT"};
    } else if (name == "Add") {
      definition.attributesAdded = QStringList{"$(NEW)"};
      parameter = "NEW";
      type = "OPTIONAL NEW_ATTR";
    } else if (name == "Pick") {
      parameter = "MODE";
      type = "LOOKUP_CHOICE Fast,fast%Slow<space>one,slow";
    } else if (name == "Map") {
      parameter = "MODE";
      type = "CHOICE Fast%Slow";
      definition.parameterLookups.insert(parameter, QStringList{"Fast,fast"});
    } else if (name != "Copy" && name != "Broken") {
      return nullptr;
    }
    definition.parameterNames = QStringList{parameter};
    definition.parameterTypes = QStringList{type};
    definition.parameterPrompts = QStringList{"Value"};
    definition.parameterDefaults = QStringList{""};
    definition.templateLines =
        QStringList{"FACTORY_DEF * " + name + "Factory FACTORY_NAME $(XFORMER_NAME) $(INPUT_LINES) P $(" +
                    parameter + ")"};
    for (const QString& tag : definition.outputTags) {
      const QString inner = "$(XFORMER_NAME_ENCODED)|" + tag;
      definition.templateLines << "FACTORY_DEF * TeeFactory FACTORY_NAME " + inner +
                                      "_Router INPUT FEATURE_TYPE " + inner +
                                      " OUTPUT FEATURE_TYPE $(OUTPUT_" + tag + "_FTYPE) $(OUTPUT_" + tag +
                                      "_FUNCS)";
    }
    if (name == "Broken")
      definition.templateLines << "# $[";
    auto cfg = std::make_unique<TransformerCfg>();
    cfg->configure(definition);
    return cfg;
  }
};
