// One thing that was found wrong.
#pragma once

#include <transform/findings/Rules.h>

#include <QString>

namespace orx {

struct Finding {
  Rule rule = Rule::InvalidValue;
  Severity severity = Severity::Error;
  QString file;
  int line = 0;       // of the element in the file, from 1; 0 when the whole file is meant
  QString node;       // empty when no node is meant
  QString text;       // for the user, in the current language
  QString parameter;  // name of the parameter that is meant; empty when none is
  long message = 0;   // number of the text; 0 when a part of the system that knows no numbers put it together
};

// The text with its node in front, as findings are shown.
ORX_EXPORT QString textWithNode(const Finding& finding);
// FILE:LINE: severity: text; the line is left out when it is 0.
ORX_EXPORT QString formatFinding(const QString& file, int line, const QString& severity, const QString& text);
// FILE:LINE: error|warning|hint: NODE: text
ORX_EXPORT QString formatFinding(const Finding& finding);

}  // namespace orx
