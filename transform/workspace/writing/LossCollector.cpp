#include <transform/workspace/writing/LossCollector.h>

using Attribute = ElementTable::Attribute;

namespace {

// Whether the text says something else than its absence would.
template <class R>
bool differsFromDefault(const AttributeRule<R>& rule, const QString& text) {
  static const R plain;
  R record;
  RecordReader::readValue(rule, record, text);
  return std::visit([&](const auto& value) { return valueOf(value, record) != valueOf(value, plain); },
                    rule.value);
}

}  // namespace

bool LossCollector::isNamed(Place element, const Word& name) const {
  return m_elements.isNamed(element, name);
}

void LossCollector::report(Kind kind, Place element, const QString& attribute, const QString& value) {
  m_losses.push_back({kind, m_elements.line(element), m_elements.name(element), attribute, value});
}

void LossCollector::allAttributes(Place element) {
  m_elements.eachAttribute(element, [&](const Attribute& attribute) {
    report(Kind::UnknownAttribute, element, attribute.name, attribute.value);
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
    const QString name = m_elements.attribute(element, words::kName);
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
  std::size_t hint = 0;
  Record whole;
  m_elements.eachAttribute(element, [&](const Attribute& attribute) {
    if (const auto* const rule = findRule<Table>(attribute.name, hint))
      RecordReader::readValue(*rule, whole, attribute.value);
  });
  hint = 0;
  m_elements.eachAttribute(element, [&](const Attribute& attribute) {
    const auto* const rule = findRule<Table>(attribute.name, hint);
    const auto lose = [&](Kind kind) { report(kind, element, attribute.name, attribute.value); };
    if (!rule) {
      lose(Kind::UnknownAttribute);
      return;
    }
    const auto* const special = std::get_if<SpecialValue<Record>>(&rule->value);
    Record read;
    if (!RecordReader::readValue(*rule, read, attribute.value))
      lose(Kind::MalformedValue);
    else if (special && special->write(read) != special->write(whole))
      report(Kind::ChangedValue, element, attribute.name, special->write(whole));
    else if (rule->emission == Emission::Never && differsFromDefault(*rule, attribute.value))
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
