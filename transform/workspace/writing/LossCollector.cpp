#include <transform/workspace/writing/LossCollector.h>

using XERCES_CPP_NAMESPACE::DOMAttr;
using XERCES_CPP_NAMESPACE::XMLString;

namespace {

template <class Visitor>
void eachAttribute(const ElementTable::Element& element, Visitor&& visit) {
  const auto* const attributes = element.getAttributes();
  for (XMLSize_t i = 0; i < attributes->getLength(); ++i)
    visit(*static_cast<const DOMAttr*>(attributes->item(i)));
}

// Whether the text says something else than its absence would.
template <class R>
bool differsFromDefault(const AttributeRule<R>& rule, const XMLCh* text) {
  static const R plain;
  R record;
  RecordReader::readValue(rule, record, text);
  return std::visit([&](const auto& value) { return valueOf(value, record) != valueOf(value, plain); },
                    rule.value);
}

}  // namespace

bool LossCollector::isNamed(Place element, const Word& name) const {
  return XMLString::equals(m_elements.element(element).getTagName(), name.text);
}

void LossCollector::report(Kind kind, Place element, const QString& attribute, const QString& value) {
  m_losses.push_back(
      {kind, m_elements.line(element), fromXml(m_elements.element(element).getTagName()), attribute, value});
}

void LossCollector::allAttributes(Place element) {
  eachAttribute(m_elements.element(element), [&](const DOMAttr& attribute) {
    report(Kind::UnknownAttribute, element, fromXml(attribute.getName()), fromXml(attribute.getValue()));
  });
}

void LossCollector::everything(Place holder, Kind kind) {
  allAttributes(holder);
  m_elements.eachChild(holder, [&](Place element) { report(kind, element); });
}

void LossCollector::document(Place root) {
  const bool isKnown = isNamed(root, words::kWorkspace) || isNamed(root, words::kDatasource) ||
                       isNamed(root, words::kEtlTool) || isNamed(root, words::kTransformer);
  if (!isKnown)
    report(Kind::Root, root);
  sections(root, true);
}

void LossCollector::sections(Place parent, bool isMain) {
  m_elements.eachChild(parent, [&](Place element) {
    const bool isKnown = documentSection(element) || (isMain && mainSection(element));
    if (!isKnown)
      report(Kind::UnknownElement, element);
  });
}

bool LossCollector::documentSection(Place element) {
  if (isNamed(element, words::kGlobalParameters))
    section<tables::GlobalParameter>(element);
  else if (isNamed(element, words::kComments))
    section<tables::Comment>(element);
  else if (isNamed(element, words::kConstants))
    everything(element, Kind::Constant);
  else if (isNamed(element, words::kBookmarks))
    section<tables::Bookmark>(element);
  else if (isNamed(element, words::kTransformers))
    section<tables::Transformer>(element);
  else if (isNamed(element, words::kSubdocumentIos))
    section<tables::SubDocumentIO>(element);
  else if (isNamed(element, words::kFeatLinks))
    section<tables::FeatLink>(element);
  else if (isNamed(element, words::kBreakpoints))
    section<tables::Breakpoint>(element);
  else if (isNamed(element, words::kAttrLinks))
    section<tables::AttrLink>(element);
  else
    return false;
  return true;
}

bool LossCollector::mainSection(Place element) {
  if (isNamed(element, words::kDatasets))
    section<tables::Dataset>(element);
  else if (isNamed(element, words::kDataTypes))
    section<tables::DataType>(element);
  else if (isNamed(element, words::kGeomTypes))
    section<tables::GeomType>(element);
  else if (isNamed(element, words::kFeatureTypes))
    section<tables::FeatureType>(element);
  else if (isNamed(element, words::kOrxserver))
    server(element);
  else if (isNamed(element, words::kSubdocuments))
    subDocuments(element);
  else if (isNamed(element, words::kLookupTables))
    everything(element, Kind::UnknownElement);
  else
    return false;
  return true;
}

void LossCollector::server(Place element) {
  if (m_hasServer) {
    report(Kind::RepeatedElement, element);
    return;
  }
  m_hasServer = true;
  record<tables::ServerParameter>(element);
}

void LossCollector::subDocuments(Place holder) {
  allAttributes(holder);
  m_elements.eachChild(holder, [&](Place element) {
    if (!isNamed(element, words::kSubdocument)) {
      report(Kind::UnknownElement, element);
      return;
    }
    const QString name = fromXml(m_elements.element(element).getAttribute(words::kName.text));
    if (name.isEmpty() || m_subDocuments.contains(name)) {
      report(Kind::SubDocument, element, name);
      return;
    }
    m_subDocuments.insert(name);
    sections(element, false);
  });
}

template <class Table>
void LossCollector::section(Place holder) {
  allAttributes(holder);
  m_elements.eachChild(holder, [&](Place element) {
    if (isNamed(element, Table::element))
      record<Table>(element);
    else
      report(Kind::UnknownElement, element);
  });
}

template <class Table>
void LossCollector::record(Place element) {
  using Record = typename Table::Record;
  const auto& rules = SortedRules<Table>::get();
  std::size_t hint = 0;
  Record whole;
  eachAttribute(m_elements.element(element), [&](const DOMAttr& attribute) {
    if (const auto* const rule = rules.find(attribute.getName(), hint))
      RecordReader::readValue(*rule, whole, attribute.getValue());
  });
  hint = 0;
  eachAttribute(m_elements.element(element), [&](const DOMAttr& attribute) {
    const auto* const rule = rules.find(attribute.getName(), hint);
    const auto lose = [&](Kind kind) {
      report(kind, element, fromXml(attribute.getName()), fromXml(attribute.getValue()));
    };
    if (!rule) {
      lose(Kind::UnknownAttribute);
      return;
    }
    const auto* const special = std::get_if<SpecialValue<Record>>(&rule->value);
    Record read;
    if (!RecordReader::readValue(*rule, read, attribute.getValue()))
      lose(Kind::MalformedValue);
    else if (special && special->write(read) != special->write(whole))
      report(Kind::ChangedValue, element, fromXml(attribute.getName()), special->write(whole));
    else if (rule->emission == Emission::Never && differsFromDefault(*rule, attribute.getValue()))
      lose(Kind::ReadOnlyAttribute);
  });
  recordChildren<Table>(element);
}

template <class Table>
void LossCollector::recordChildren(Place element) {
  m_elements.eachChild(element, [&](Place inner) {
    const bool isKnown =
        std::apply([&](const auto&... rule) { return (child(rule, inner) || ...); }, Table::children);
    if (!isKnown)
      report(Kind::UnknownElement, inner);
  });
}

template <class R, class Table>
bool LossCollector::child(const ChildRule<R, Table>& rule, Place element) {
  if (!isNamed(element, rule.wrapper ? *rule.wrapper : Table::element) || rule.emission == Emission::Never)
    return false;
  if (rule.wrapper)
    section<Table>(element);
  else
    record<Table>(element);
  return true;
}
