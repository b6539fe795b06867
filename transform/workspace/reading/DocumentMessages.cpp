#include <transform/text/MessageStrings.h>
#include <transform/workspace/reading/DocumentMessages.h>

QString documentText(long number, const QStringList& arguments) {
  const QString text = TransformResString(number, arguments);
  return text.isEmpty() ? (QStringList(QString::number(number)) + arguments).join(QLatin1Char(' ')) : text;
}
