// Every text shown to users, by number.
#pragma once

#include <platform/Export.h>

#include <QString>
#include <QStringList>

// Unknown numbers give an empty text. One to five arguments fill the placeholders "%1" to "%5" in one pass;
// with none, or with more than five, the text is returned with its placeholders as they are.
ORX_EXPORT QString TransformResString(long number);
ORX_EXPORT QString TransformResString(long number, const QString& argument);
ORX_EXPORT QString TransformResString(long number, const QStringList& arguments);

// The message without arguments in a language of the caller's choice (two lower-case letters) instead of the
// current one; an empty one is the current one.
ORX_EXPORT QString TransformResStringIn(const QString& language, long number);

namespace orx {

// Those that the product's home has texts in, by name.
ORX_EXPORT QStringList messageLanguages();

}  // namespace orx
