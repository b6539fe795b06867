#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/Keywords.h>
#include <transform/core/StoredValue.h>
#include <transform/findings/Refusal.h>
#include <transform/specialised/shared/FactoryOption.h>
#include <transform/specialised/shared/ParameterTable.h>
#include <transform/specialised/shared/SpecialisedValues.h>
#include <transform/specialised/shared/TemplateText.h>
#include <transform/specialised/templates/XMLTemplaterTransformerCfg.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/TextHelpers.h>

#include <QRegularExpression>
#include <QSet>
#include <boost/graph/adjacency_list.hpp>
#include <boost/graph/strong_components.hpp>

#include <vector>

namespace messages = orx::messages;

namespace {

const QLatin1String kRootTemplate("ROOT_TEMPLATE");
const QLatin1String kSubTemplates("SUB_TEMPLATES");
const QLatin1String kTemplateKey("TEMPLATE");

enum Column { kName, kTemplate, kColumns };

// Whether an input may bear the name: it stands bare in statements.
bool isTag(const QString& name) {
  static const QRegularExpression tag(QStringLiteral("^[A-Za-z][A-Za-z0-9_]*$"));
  return tag.match(name).hasMatch();
}

// The name of a template that asks for itself, by way of others or not; empty when there is none.
QString findCircle(const QHash<QString, QStringList>& inserted, const QStringList& names) {
  QHash<QString, std::size_t> numbers;
  for (const QString& name : names) {
    numbers.insert(name, static_cast<std::size_t>(numbers.size()));
  }
  boost::adjacency_list<boost::vecS, boost::vecS, boost::directedS> graph(
      static_cast<std::size_t>(names.size()));
  for (const QString& name : names) {
    for (const QString& other : inserted.value(name)) {
      boost::add_edge(numbers.value(name), numbers.value(other), graph);
    }
  }
  std::vector<std::size_t> circles(boost::num_vertices(graph));
  boost::strong_components(
      graph, boost::make_iterator_property_map(circles.begin(), boost::get(boost::vertex_index, graph)));
  for (const QString& name : names) {
    for (const QString& other : inserted.value(name)) {
      if (circles[numbers.value(name)] == circles[numbers.value(other)]) {
        return name;
      }
    }
  }
  return QString();
}

}  // namespace

const QStringList& XMLTemplaterTransformerCfg::subTemplateTags() const {
  const QString value = getParameterValue(kSubTemplates, UnpackLevel::Resolved);
  if (value != m_tagsOf) {
    m_tagsOf = value;
    m_tags.clear();
    const ParameterTable templates(getParameterByMacroName(kSubTemplates), value, kColumns);
    for (int row = 0; row < templates.rowCount(); ++row) {
      const QString name = templates.cell(row, kName);
      if (isTag(name)) {
        m_tags.append(name);
      }
    }
  }
  return m_tags;
}

void XMLTemplaterTransformerCfg::getInputTags(QStringList& tags, QHash<QString, QString>* shownNames) const {
  TransformerCfg::getInputTags(tags, shownNames);
  tags += subTemplateTags();
  tags.removeDuplicates();
}

bool XMLTemplaterTransformerCfg::validateParameter(const QString& parameter, QString& message) const {
  return TransformerCfg::validateParameter(parameter, message) &&
         (parameter != kRootTemplate || validateRoot(message)) &&
         (parameter != kSubTemplates || validateSubTemplates(message));
}

bool XMLTemplaterTransformerCfg::validateRoot(QString& message) const {
  const QString value = getParameterValue(kRootTemplate, UnpackLevel::Resolved);
  if (isUnsetValue(value)) {
    return true;
  }
  QSet<QString> known;
  const ParameterTable templates(*this, kSubTemplates, kColumns, UnpackLevel::Resolved);
  for (int row = 0; row < templates.rowCount(); ++row) {
    known.insert(QORXWwjdDecode(templates.cell(row, kName)));
  }
  for (const QString& possible : possibleValues(value)) {
    const TemplateText text(possible, TemplateText::languageOf(m_isJson));
    int line = 0;
    if (!text.isWellFormed(TemplateText::Extent::Document, line)) {
      return orx::refuse(message, messages::kNotWellFormed, {QString::number(line)});
    }
    for (const QString& name : text.insertedTemplates()) {
      if (!known.contains(name)) {
        return orx::refuse(message, messages::kNoSubTemplate, {name});
      }
    }
  }
  return true;
}

bool XMLTemplaterTransformerCfg::validateSubTemplates(QString& message) const {
  const ParameterTable templates(*this, kSubTemplates, kColumns, UnpackLevel::Resolved);
  QStringList taken;
  TransformerCfg::getInputTags(taken);
  QSet<QString> known(taken.begin(), taken.end());
  QStringList names;
  QHash<QString, QStringList> inserted;
  for (int row = 0; row < templates.rowCount(); ++row) {
    const QString name = QORXWwjdDecode(templates.cell(row, kName));
    if (!isTag(name)) {
      return orx::refuse(message, messages::kBadInputName, {name});
    }
    if (known.contains(name)) {
      return orx::refuse(message, messages::kInputNameTwice, {name});
    }
    if (isUnsetValue(templates.cell(row, kTemplate))) {
      return templates.refuseMissing(message, kTemplate);
    }
    if (templates.cell(row, kTemplate).startsWith(kConditionalPrefix)) {
      return ParameterTable::refuseRow(message, row, messages::kConditionInTemplate);
    }
    known.insert(name);
    names.append(name);
    const TemplateText text(templates.cell(row, kTemplate), TemplateText::languageOf(m_isJson));
    int line = 0;
    if (!text.isWellFormed(TemplateText::Extent::Fragment, line)) {
      orx::refuse(message, messages::kNotWellFormed, {QString::number(line)});
      message.prepend(name + QLatin1String(": "));
      return false;
    }
    inserted.insert(name, text.insertedTemplates());
  }
  for (const QString& name : std::as_const(names)) {
    for (const QString& other : inserted.value(name)) {
      if (!inserted.contains(other)) {
        return orx::refuse(message, messages::kNoSubTemplate, {other});
      }
    }
  }
  const QString circle = findCircle(inserted, names);
  return circle.isEmpty() || orx::refuse(message, messages::kTemplateCircle, {circle});
}

bool XMLTemplaterTransformerCfg::doInstantiate(MFBuffer& buffer, bool inlineFlag) {
  const TransformParamCfg* record = getParameterByMacroName(kSubTemplates);
  const ParameterTable templates(record, stripBasicStringInfo(getParameterValue(kSubTemplates)), kColumns);
  if (!TransformerCfg::doInstantiate(buffer, inlineFlag)) {
    return false;
  }
  for (int row = 0; row < templates.rowCount(); ++row) {
    if (!writeFactoryOption(*this, kTemplateKey,
                            templates.cell(row, kName) + QLatin1Char(' ') +
                                quotifyStringForMF(templates.cell(row, kTemplate)),
                            buffer)) {
      return false;
    }
  }
  return true;
}
