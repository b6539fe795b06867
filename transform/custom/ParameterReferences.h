// References to parameters, "$(NAME)", inside values.
#pragma once

#include <QString>

#include <functional>

// Asks for the replacement of each reference, from left to right; one for which `replace` answers false
// stays.
QString replaceParameterReferences(
    const QString& text, const std::function<bool(const QString& name, QString& replacement)>& replace);

// Whether `matches` answers true for any of the names.
bool anyParameterReference(const QString& text, const std::function<bool(const QString& name)>& matches);
