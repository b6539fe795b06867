#include <transform/core/Keywords.h>
#include <transform/core/TransformParamCfg.h>
#include <transform/core/TransformerCfg.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <transform/workspace/ParameterLines.h>
#include <translation/mappingfile/HarmlessText.h>
#include <translation/mappingfile/WrittenCheck.h>

#include <QSet>

#include <algorithm>

namespace messages = orx::messages;

using orx::Rule;

namespace {

// The parameters that may lead to a fault: with values of their own that are not harmless.
std::vector<QString> suspects(const TransformerCfg& cfg) {
  std::vector<QString> found;
  for (const QString& name : cfg.getParameters()) {
    const TransformParamCfg* record = cfg.getParameterByMacroName(name);
    if (record && name != kIdentifierParameter && record->getValue() != record->getDefaultValue() &&
        !isHarmlessText(record->getValue()))
      found.push_back(name);
  }
  return found;
}

// Which of them is meant by what the fault quotes; empty when that cannot be told.
QString culprit(const TransformerCfg& cfg, const QString& fault) {
  std::vector<QString> found = suspects(cfg);
  if (found.size() > 1) {
    found.erase(
        std::remove_if(found.begin(), found.end(),
                       [&](const QString& name) {
                         return !fault.contains(cfg.getParameterByMacroName(name)->getValue().trimmed());
                       }),
        found.end());
  }
  return found.size() == 1 ? found.front() : QString();
}

}  // namespace

qint64 WrittenCheck::Device::writeData(const char* bytes, qint64 size) {
  m_check.write(QByteArray::fromRawData(bytes, static_cast<int>(size)));
  return size;
}

WrittenCheck::WrittenCheck(MFBuffer& target) : m_target(target), m_device(*this), m_check(m_found) {
  m_device.open(QIODevice::WriteOnly | QIODevice::Unbuffered);
  setDevice(&m_device);
}

WrittenCheck::~WrittenCheck() {
  setDevice(nullptr);
}

void WrittenCheck::write(const QByteArray& bytes) {
  m_target.write(bytes);
  if (!m_isJudged)
    return;
  m_check.reader().feed(bytes);
  m_check.run();
}

void WrittenCheck::begin(const WrittenPlace& place, int linesAhead) {
  m_isJudged = true;
  m_places.emplace_back(m_check.reader().lineNumber() + 1 + linesAhead, place);
}

const WrittenPlace& WrittenCheck::placeOf(int line) const {
  static const WrittenPlace kFrame;
  const auto behind = std::upper_bound(m_places.begin(), m_places.end(), line,
                                       [](int wanted, const auto& entry) { return wanted < entry.first; });
  return behind == m_places.begin() ? kFrame : std::prev(behind)->second;
}

void WrittenCheck::finish(const CustomTransformerLookup& isInstalled, orx::Findings& findings) {
  m_check.reader().endFeed();
  m_check.run();
  m_check.finish(isInstalled);
  std::vector<orx::Finding> faults = m_found.all();
  std::stable_sort(faults.begin(), faults.end(),
                   [](const orx::Finding& a, const orx::Finding& b) { return a.line < b.line; });
  QSet<QString> withReferences;
  for (const orx::Finding& finding : findings.all()) {
    if (finding.rule == Rule::UnknownReference)
      withReferences.insert(finding.node);
  }
  QSet<QPair<int, QString>> told;
  bool isHeaderFaulty = false;
  for (const orx::Finding& fault : faults) {
    const WrittenPlace& place = placeOf(fault.line);
    const QPair<int, QString> key(place.line, place.name);
    const bool isTold =
        told.contains(key) || (fault.rule == Rule::UnknownReference && withReferences.contains(place.name));
    const bool isHeader = place.kind == WrittenPlace::Kind::HeaderLine;
    // What a header line leaves open swallows what stands behind it.
    if (fault.severity != orx::Severity::Error || isTold || (isHeaderFaulty && !isHeader))
      continue;
    isHeaderFaulty = isHeaderFaulty || isHeader;
    told.insert(key);
    report(place, fault, findings);
  }
}

void WrittenCheck::report(const WrittenPlace& place, const orx::Finding& fault, orx::Findings& findings) {
  const bool isNode = place.kind == WrittenPlace::Kind::Node;
  const QString node = isNode ? place.name : QString();
  // Where a reference leads is judged by a rule that settings may lower.
  if (fault.rule == Rule::UnknownReference) {
    findings.reportParameter(fault.rule, fault.message, place.line, node, QString(), fault.text);
    return;
  }
  QString parameter = place.kind == WrittenPlace::Kind::Parameter ? place.name : QString();
  int line = place.line;
  if (place.cfg) {
    parameter = culprit(*place.cfg, fault.text);
    line = parameter.isEmpty() || !place.parameterLines ? line : place.parameterLines->of(parameter);
  }
  if (!parameter.isEmpty())
    findings.reportUnwritable(line, node, parameter, TransformResString(messages::kFaultyValue, fault.text));
  else
    findings.reportAs(Rule::UnwritableValue,
                      place.kind == WrittenPlace::Kind::HeaderLine ? messages::kFaultyHeaderLine
                                                                   : messages::kFaultyStatements,
                      line, node, {fault.text});
}
