// References to parameters and macros, "$(NAME)", inside values. In nested references such as "$($(A)_B)" the
// innermost counts.
#pragma once

#include <platform/Export.h>

#include <QString>

#include <functional>

// Carries out the references of a text as far as their values are known; the others stay. False when they do
// not come to an end.
using ExpandReferences = std::function<bool(QString& text)>;

// Asks for the replacement of each reference, from left to right; one for which `replace` answers false
// stays. What is put in is not looked at again.
ORX_EXPORT QString replaceParameterReferences(
    const QString& text, const std::function<bool(const QString& name, QString& replacement)>& replace);

// Whether `matches` answers true for any of the names.
ORX_EXPORT bool anyParameterReference(const QString& text,
                                      const std::function<bool(const QString& name)>& matches);
