#include <platform/orxparameter/orxparameter.h>
#include <platform/qorxcore/Lists.h>
#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/Keywords.h>
#include <transform/core/ParameterSet.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/parameters/DynamicGroups.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>

#include <QHash>
#include <QSet>

#include <set>

namespace messages = orx::messages;

namespace {

// More groups than anyone can look through come from a value that is no list of names.
constexpr int kMostGroups = 1000;

QStringList groupNames(const QString& value) {
  if (isUnsetValue(value)) {
    return QStringList();
  }
  QStringList names = QORXSdfStringToList(value, QLatin1Char(','));
  names.removeAll(QString());
  names.removeDuplicates();
  return names.mid(0, kMostGroups);
}

// The parameters that each group frames: those whose names begin with the group's and "_".
QHash<QString, QStringList> framedParameters(const ParameterSet& parameters, const QStringList& groups) {
  const QSet<QString> known(groups.begin(), groups.end());
  std::set<int> lengths;
  for (const QString& group : groups) {
    lengths.insert(group.size());
  }
  QHash<QString, QStringList> framed;
  for (const QString& name : parameters.names()) {
    if (name.startsWith(kDynamicGroupPrefix)) {
      continue;
    }
    for (const int length : lengths) {
      if (length < name.size() && name.at(length) == QLatin1Char('_') && known.contains(name.left(length))) {
        framed[name.left(length)].append(ORX_quoteConfigPiece(name));
      }
    }
  }
  return framed;
}

}  // namespace

void updateDynamicParameterGroups(const TransformerCfg& cfg, ParameterSet& parameters,
                                  const QString& parameter) {
  const QStringList groups = groupNames(cfg.getParameterValue(parameter));
  const QHash<QString, QStringList> framed = framedParameters(parameters, groups);
  const QString prefix = kDynamicGroupPrefix + parameter + QLatin1Char('_');
  int number = 0;
  for (const QString& group : groups) {
    const QString name = prefix + QString::number(++number);
    const QString shown = QORXWwjdDecode(group);
    const QString type = kDynamicGroupType + QLatin1Char(' ') + framed.value(group).join(QLatin1Char('%'));
    TransformParamCfg record(
        GUIType::fromTransformerTypeString(type, name, TransformResString(messages::kGroupTitle, shown)));
    record.setDefaultValue(shown);
    record.setValue(shown);
    const int index = parameters.indexOf(name);
    if (index < 0) {
      parameters.append(record);
    } else {
      parameters.records()[static_cast<std::size_t>(index)] = record;
    }
  }
  QSet<QString> surplus;
  for (QString name = prefix + QString::number(++number); parameters.indexOf(name) >= 0;
       name = prefix + QString::number(++number)) {
    surplus.insert(name);
  }
  parameters.remove(surplus);
}
