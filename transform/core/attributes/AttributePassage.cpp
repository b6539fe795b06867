#include <transform/core/AttributeRules.h>
#include <transform/core/AttributeSet.h>
#include <transform/core/Keywords.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/attributes/AttributePassage.h>

namespace {

// References multiply each other's names; more than this is no sensible definition.
constexpr int kMostExpandedTexts = 100000;

}  // namespace

QStringList expandParameterText(const TransformerCfg& cfg, const ParameterText& text) {
  QStringList results(QString{});
  for (const ParameterText::Piece& piece : text.pieces()) {
    const QStringList parts =
        piece.isParameter ? cfg.attributesListedBy(piece.text) : QStringList(piece.text);
    if (qint64(results.size()) * parts.size() > kMostExpandedTexts) {
      return QStringList();
    }
    QStringList longer;
    longer.reserve(results.size() * parts.size());
    for (const QString& begun : std::as_const(results)) {
      for (const QString& part : parts) {
        longer.append(begun + part);
      }
    }
    results.swap(longer);
  }
  return text.isEmpty() ? QStringList() : results;
}

AttributePassage::AttributePassage(const TransformerCfg& cfg, const PreservedAttributes& preserved,
                                   const AttributeRules& rules, const QString& inputTag,
                                   const QString& outputTag)
    : m_preserved(preserved), m_inputTag(inputTag), m_outputTag(outputTag) {
  if (!rules.listActions.isEmpty()) {
    apply(cfg, rules, kAllToken);
    apply(cfg, rules, outputTag);
  }
}

void AttributePassage::apply(const TransformerCfg& cfg, const AttributeRules& rules, const QString& key) {
  const auto actions = rules.listActions.constFind(key);
  if (actions == rules.listActions.constEnd()) {
    return;
  }
  for (const ListAction& action : *actions) {
    switch (action.kind) {
      case ListAction::Kind::Keep:
        m_dropsLists = false;
        break;
      case ListAction::Kind::Drop:
        m_dropsLists = true;
        break;
      case ListAction::Kind::Collect:
        if (action.inputTag == m_inputTag) {
          m_collectingLists += listNames(cfg, action.list);
        }
        break;
      case ListAction::Kind::Explode:
        m_explodedLists += listNames(cfg, action.list);
        break;
    }
  }
}

QStringList AttributePassage::listNames(const TransformerCfg& cfg, const ParameterText& text) {
  QStringList names = expandParameterText(cfg, text);
  for (QString& name : names) {
    name += name.endsWith(kListMark) ? QLatin1String(".") : kListMemberMark;
  }
  return names;
}

void AttributePassage::pass(const QString& attribute, QStringList& result) const {
  const bool isList = attribute.contains(kListMark);
  bool isExploded = false;
  if (isList) {
    for (const QString& list : m_explodedLists) {
      if (attribute.startsWith(list)) {
        isExploded = true;
        if (attribute.size() > list.size()) {
          result.append(attribute.mid(list.size()));
        }
      } else if (attribute.size() + 1 == list.size() && list.startsWith(attribute)) {
        isExploded = true;
      }
    }
  }
  if (!isExploded && !(isList && m_dropsLists) && m_preserved.passes(attribute, m_inputTag, m_outputTag)) {
    result.append(attribute);
  }
  for (const QString& list : m_collectingLists) {
    result.append(list + attribute);
  }
}

void AttributePassage::pass(const AttributeSet& attributes, AttributeSet& result) const {
  if (!m_collectingLists.isEmpty() || !m_explodedLists.isEmpty()) {
    QStringList passed;
    for (const QString& attribute : attributes.names())
      pass(attribute, passed);
    result.add(passed);
    return;
  }
  const AttributeSet passed =
      m_preserved.passesAll(m_inputTag, m_outputTag) ? attributes : attributes.only(m_preserved.names);
  result.add(m_dropsLists ? passed.withoutLists() : passed);
}
