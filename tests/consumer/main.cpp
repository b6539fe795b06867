// Reads a workspace through the installed libraries and says where they found their home.
#include <platform/orxutil/orxutil.h>
#include <platform/qorxcore/qorxcore.h>
#include <transform/text/MessageStrings.h>
#include <transform/workspace/IXMLComponentReader.h>
#include <transform/workspace/WorkspaceLoaderException.h>

#include <QDir>
#include <QStringList>

#include <iostream>

namespace {

void print(const char* what, const QString& text) {
  std::cout << what << ": " << text.toStdString() << '\n';
}

int countDefinitions() {
  int count = 0;
  for (const QString& folder : ORX_resourceDirectories(QStringLiteral("transformer"))) {
    count += QDir(folder).entryList({QStringLiteral("*.ort")}, QDir::Files).size();
  }
  return count;
}

}  // namespace

int main(int argc, char** argv) {
  if (argc != 2) {
    std::cerr << "usage: consumer WORKSPACE\n";
    return 2;
  }
  print("home", QORXOrxHome());
  print("message 370608", TransformResString(370608, QStringLiteral("WIDTH")));
  std::cout << "definition files: " << countDefinitions() << '\n';
  try {
    const std::unique_ptr<IXMLComponentReader> reader = IXMLComponentReader::create();
    QStringList headerLines;
    reader->ReadInput(QORXFromLocal8Bit(argv[1]), headerLines);
    for (const TransformerStruct& transformer : reader->GetTransformerList(QString())) {
      print("transformer", transformer.type);
    }
  } catch (const WorkspaceLoaderException& refused) {
    std::cerr << refused.what() << '\n';
    return 1;
  }
  return 0;
}
