#include <transform/text/GlobalMacros.h>

#include <QHash>

namespace {

GlobalMacro macro(const char* name, const char* displayName) {
  return {QLatin1String(name), QLatin1String(displayName)};
}

// Macro names, and display names leading to them. Both are unique.
struct Lookup {
  QHash<QString, QString> byName;
  QHash<QString, QString> byDisplayName;

  Lookup() {
    for (const GlobalMacro& entry : globalMacros()) {
      const QString name = entry.name;
      byName.insert(name, name);
      byDisplayName.insert(entry.displayName, name);
    }
  }
};

const Lookup& lookup() {
  static const Lookup kLookup;
  return kLookup;
}

}  // namespace

const std::vector<GlobalMacro>& globalMacros() {
  static const std::vector<GlobalMacro> kMacros = {
      macro("ORX_HOME", "Home Folder"),
      macro("ORX_BUILD_NUM", "Build Number"),
      macro("ORX_BUILD_DATE", "Build Date"),
      macro("ORX_PRODUCT_NAME", "Product Name"),
      macro("ORX_PLATFORM", "Platform"),
      macro("WORKSPACE_NAME", "Workspace Name"),
      macro("ORX_WORKSPACE_DIR", "Workspace Folder"),
      macro("ORX_WORKSPACE_FILE", "Workspace File"),
      macro("ORX_MF_NAME", "Mapping File Name"),
      macro("ORX_MF_DIR", "Mapping File Folder"),
      macro("ORX_LOG_FILE", "Log File"),
      macro("ORX_TEMP_DIR", "Temporary Folder"),
      macro("ORX_USER_DIR", "User Data Folder"),
      macro("ORX_USER_NAME", "User Name"),
      macro("ORX_HOST_NAME", "Host Name"),
      macro("ORX_PROCESS_ID", "Process Identifier"),
      macro("ORX_JOB_ID", "Job Identifier"),
      macro("ORX_LANGUAGE", "Language"),
      macro("ORX_START_TIME", "Start Time"),
  };
  return kMacros;
}

bool isGlobalMacro(const QString& name) {
  return lookup().byName.contains(name);
}

QString globalMacroName(const QString& nameOrDisplayName) {
  const Lookup& tables = lookup();
  const auto found = tables.byName.constFind(nameOrDisplayName);
  return found != tables.byName.constEnd() ? *found : tables.byDisplayName.value(nameOrDisplayName);
}

bool isMacroReference(const QString& text) {
  return text.startsWith(QLatin1String("$(")) && text.endsWith(QLatin1Char(')'));
}

bool isWrappedMacroReference(const QString& text) {
  const auto stands = [&text](int position, const char* any) {
    return QLatin1String(any).contains(text.at(position));
  };
  return text.size() >= 5 && stands(0, "\"{") && stands(text.size() - 1, "\"}") &&
         isMacroReference(text.mid(1, text.size() - 2));
}

QString macroNamedBy(const QString& entry) {
  if (isMacroReference(entry)) {
    return entry.mid(2, entry.size() - 3);
  }
  return isWrappedMacroReference(entry) ? entry.mid(3, entry.size() - 5) : globalMacroName(entry);
}
