// The part of TransformerCfg that fills tooltips in.
#include <transform/core/ConfiguredDefinition.h>
#include <transform/core/Keywords.h>
#include <transform/core/TransformerCfg.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>

#include <QScopedValueRollback>

#include <functional>

namespace messages = orx::messages;

namespace {

QString escaped(const QString& text, bool asHtml) {
  if (!asHtml) {
    return text;
  }
  QString html = text.toHtmlEscaped();
  html.replace(QLatin1Char('\n'), QLatin1String("<br>"));
  return html;
}

// Replaces tokens "$(NAME)" in one pass: what comes in is not looked at again. `find` fills in the text and
// answers whether it knows the name; other tokens stay.
void replaceTokens(QString& line, const std::function<bool(const QString& name, QString& text)>& find) {
  int open = line.indexOf(kMacroOpen);
  if (open < 0) {
    return;
  }
  QString result;
  int position = 0;
  while (open >= 0) {
    const int start = open + kMacroOpen.size();
    const int close = line.indexOf(QLatin1Char(')'), start);
    if (close < 0) {
      break;
    }
    QString text;
    result += line.midRef(position, open - position);
    if (find(line.mid(start, close - start), text)) {
      result += text;
      position = close + 1;
    } else {
      result += kMacroOpen;
      position = start;
    }
    open = line.indexOf(kMacroOpen, position);
  }
  line = result + line.midRef(position);
}

}  // namespace

void TransformerCfg::getTooltipLines(QStringList& lines, bool asHtml) const {
  const Call call{nullptr, asHtml};
  const QScopedValueRollback<const Call*> scope(m_call, &call);
  lines = configured().fields.tooltipLines;
  QHash<QString, QString> tokens;
  QStringList further;
  QString title;
  tooltipCustomizations(tokens, further, title);
  substParametersForToolTips(lines);
  if (!tokens.isEmpty()) {
    for (QString& line : lines) {
      replaceTokens(line, [&](const QString& name, QString& text) {
        const auto token = tokens.constFind(name);
        if (token == tokens.constEnd()) {
          return false;
        }
        text = escaped(*token, asHtml);
        return true;
      });
    }
  }
  if (!title.isEmpty()) {
    lines.prepend(asHtml ? QLatin1String("<b>") + escaped(title, asHtml) + QLatin1String("</b>") : title);
  }
  for (const QString& line : std::as_const(further)) {
    lines.append(escaped(line, asHtml));
  }
}

void TransformerCfg::substParametersForToolTips(QStringList& lines) const {
  for (QString& line : lines) {
    replaceTokens(line, [this](const QString& name, QString& text) {
      if (!getParameterByMacroName(name)) {
        return false;
      }
      text = tooltipValue(name);
      return true;
    });
  }
}

QString TransformerCfg::tooltipValue(const QString& parameter) const {
  QString text = getParameterDisplayValue(parameter, UnpackLevel::Decoded);
  if (text == kUnusedGroupBy && parameter == configured().fields.multiProcess) {
    text.clear();
  }
  return escaped(text.isEmpty() ? TransformResString(messages::kNotSet) : text, m_call && m_call->isHtml);
}
