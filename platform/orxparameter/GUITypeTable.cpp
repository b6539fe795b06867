#include <platform/orxparameter/GUITypeTable.h>

#include <algorithm>

namespace {

constexpr bool kConfig = true;
constexpr bool kNoConfig = false;
constexpr bool kEncoded = true;
constexpr bool kPlain = false;

}  // namespace

const std::vector<GUITypeEntry>& ORX_guiTypes() {
  static const std::vector<GUITypeEntry> types = {
      {QLatin1String("ATTR"), kConfig, kPlain,
       QLatin1String(
           "One attribute that reaches the transformer; with the configuration ALLOW_NEW also a new one.")},
      {QLatin1String("ATTR_ENCODED"), kConfig, kEncoded,
       QLatin1String("One attribute, as ATTR; any characters.")},
      {QLatin1String("ATTR_LIST"), kConfig, kPlain,
       QLatin1String("Any number of attributes; with the configuration ALLOW_NEW also new ones.")},
      {QLatin1String("ATTR_LIST_ENCODED"), kConfig, kEncoded,
       QLatin1String("Any number of attributes, as ATTR_LIST; any characters.")},
      {QLatin1String("CHECKBOX"), kConfig, kPlain,
       QLatin1String(
           "A box to tick; the configuration is the value when ticked and when not, YES%NO when empty.")},
      {QLatin1String("CHOICE"), kConfig, kPlain,
       QLatin1String("One of the values of the configuration, separated by %.")},
      {QLatin1String("CHOICE_OR_ATTR"), kConfig, kPlain,
       QLatin1String(
           "One of the values of the configuration, separated by %, or an attribute that holds it.")},
      {QLatin1String("COLOR"), kNoConfig, kPlain, QLatin1String("A colour.")},
      {QLatin1String("COLOR_OR_ATTR"), kNoConfig, kPlain,
       QLatin1String("A colour, or an attribute that holds it.")},
      {QLatin1String("COORDSYS"), kNoConfig, kPlain, QLatin1String("A coordinate system.")},
      {QLatin1String("COORDSYS_OR_ATTR"), kNoConfig, kPlain,
       QLatin1String("A coordinate system, or an attribute that holds it.")},
      {QLatin1String("COORDSYS_OR_ATTR_ENCODED"), kNoConfig, kEncoded,
       QLatin1String("A coordinate system, or an attribute that holds it; any characters.")},
      {QLatin1String("DATE"), kNoConfig, kPlain, QLatin1String("A date.")},
      {QLatin1String("DATETIME"), kNoConfig, kPlain, QLatin1String("A date with its time of day.")},
      {QLatin1String("DATETIME_OR_ATTR"), kNoConfig, kPlain,
       QLatin1String("A date with its time of day, or an attribute that holds it.")},
      {QLatin1String("DATE_OR_ATTR"), kNoConfig, kPlain,
       QLatin1String("A date, or an attribute that holds it.")},
      {QLatin1String("DIRNAME"), kNoConfig, kPlain, QLatin1String("A folder.")},
      {QLatin1String("DIRNAME_ENCODED"), kNoConfig, kEncoded, QLatin1String("A folder; any characters.")},
      {QLatin1String("DIRNAME_OR_ATTR"), kNoConfig, kPlain,
       QLatin1String("A folder, or an attribute that holds it.")},
      {QLatin1String("DIRNAME_OR_ATTR_ENCODED"), kNoConfig, kEncoded,
       QLatin1String("A folder, or an attribute that holds it; any characters.")},
      {QLatin1String("DISCLOSUREGROUP"), kConfig, kPlain,
       QLatin1String("A frame that can be folded; the configuration names its parameters, separated by %.")},
      {QLatin1String("DIVIDER"), kNoConfig, kPlain,
       QLatin1String("A line between parameters; it has no value.")},
      {QLatin1String("EXPRESSION_ENCODED"), kNoConfig, kEncoded,
       QLatin1String("An expression over attributes, functions and numbers.")},
      {QLatin1String("FEATURE_TYPE"), kNoConfig, kPlain, QLatin1String("The name of a feature type.")},
      {QLatin1String("FEATURE_TYPE_ENCODED"), kNoConfig, kEncoded,
       QLatin1String("The name of a feature type; any characters.")},
      {QLatin1String("FEATURE_TYPE_LIST"), kNoConfig, kPlain, QLatin1String("Any number of feature types.")},
      {QLatin1String("FEATURE_TYPE_LIST_ENCODED"), kNoConfig, kEncoded,
       QLatin1String("Any number of feature types; any characters.")},
      {QLatin1String("FEATURE_TYPE_LIST_OR_ATTR_ENCODED"), kNoConfig, kEncoded,
       QLatin1String("Any number of feature types, or an attribute that holds it; any characters.")},
      {QLatin1String("FEATURE_TYPE_OR_ATTR"), kNoConfig, kPlain,
       QLatin1String("The name of a feature type, or an attribute that holds it.")},
      {QLatin1String("FEATURE_TYPE_OR_ATTR_ENCODED"), kNoConfig, kEncoded,
       QLatin1String("The name of a feature type, or an attribute that holds it; any characters.")},
      {QLatin1String("FILEMUSTEXIST"), kConfig, kPlain,
       QLatin1String("A file that has to exist, unless the value is conditional; the configuration lists the "
                     "kinds of file, name|pattern separated by %.")},
      {QLatin1String("FILEMUSTEXIST_ENCODED"), kConfig, kEncoded,
       QLatin1String("A file that has to exist, unless the value is conditional; the configuration lists the "
                     "kinds of file, name|pattern separated by %; any characters.")},
      {QLatin1String("FILEMUSTEXIST_OR_ATTR"), kConfig, kPlain,
       QLatin1String("A file that has to exist, unless the value is conditional; the configuration lists the "
                     "kinds of file, name|pattern separated by %, or an attribute that holds it.")},
      {QLatin1String("FILEMUSTEXIST_OR_ATTR_ENCODED"), kConfig, kEncoded,
       QLatin1String(
           "A file that has to exist, unless the value is conditional; the configuration lists the kinds of "
           "file, name|pattern separated by %, or an attribute that holds it; any characters.")},
      {QLatin1String("FILENAME"), kConfig, kPlain,
       QLatin1String("A file, to be read or written; the configuration lists the kinds of file, name|pattern "
                     "separated by %.")},
      {QLatin1String("FILENAME_ENCODED"), kConfig, kEncoded,
       QLatin1String("A file, to be read or written; the configuration lists the kinds of file, name|pattern "
                     "separated by %; any characters.")},
      {QLatin1String("FILENAME_MUSTEXIST"), kConfig, kPlain,
       QLatin1String("A file that has to exist; the configuration lists the kinds of file, name|pattern "
                     "separated by %.")},
      {QLatin1String("FILENAME_MUSTEXIST_ENCODED"), kConfig, kEncoded,
       QLatin1String("A file that has to exist; the configuration lists the kinds of file, name|pattern "
                     "separated by %; any characters.")},
      {QLatin1String("FILENAME_MUSTEXIST_OR_ATTR"), kConfig, kPlain,
       QLatin1String("A file that has to exist; the configuration lists the kinds of file, name|pattern "
                     "separated by %, or an attribute that holds it.")},
      {QLatin1String("FILENAME_MUSTEXIST_OR_ATTR_ENCODED"), kConfig, kEncoded,
       QLatin1String("A file that has to exist; the configuration lists the kinds of file, name|pattern "
                     "separated by %, or an attribute that holds it; any characters.")},
      {QLatin1String("FILENAME_OR_ATTR"), kConfig, kPlain,
       QLatin1String("A file, to be read or written; the configuration lists the kinds of file, name|pattern "
                     "separated by %, or an attribute that holds it.")},
      {QLatin1String("FILENAME_OR_ATTR_ENCODED"), kConfig, kEncoded,
       QLatin1String("A file, to be read or written; the configuration lists the kinds of file, name|pattern "
                     "separated by %, or an attribute that holds it; any characters.")},
      {QLatin1String("FLOAT"), kNoConfig, kPlain, QLatin1String("A number.")},
      {QLatin1String("FLOAT_OR_ATTR"), kNoConfig, kPlain,
       QLatin1String("A number, or an attribute that holds it.")},
      {QLatin1String("FORMAT"), kNoConfig, kPlain, QLatin1String("A data format.")},
      {QLatin1String("GROUP"), kConfig, kPlain,
       QLatin1String("A frame around parameters; the configuration names its parameters, separated by %.")},
      {QLatin1String("GUI_LINE_TABLE"), kConfig, kPlain,
       QLatin1String(
           "A table that grows by rows; the configuration is the separator and the columns' prompt lines.")},
      {QLatin1String("INT"), kNoConfig, kPlain, QLatin1String("A whole number.")},
      {QLatin1String("INTEGER"), kNoConfig, kPlain, QLatin1String("A whole number.")},
      {QLatin1String("INTEGER_OR_ATTR"), kNoConfig, kPlain,
       QLatin1String("A whole number, or an attribute that holds it.")},
      {QLatin1String("INT_OR_ATTR"), kNoConfig, kPlain,
       QLatin1String("A whole number, or an attribute that holds it.")},
      {QLatin1String("LISTBOX"), kConfig, kPlain,
       QLatin1String("Any of the values of the configuration, separated by %.")},
      {QLatin1String("LISTBOX_OR_ATTR"), kConfig, kPlain,
       QLatin1String(
           "Any of the values of the configuration, separated by %, or an attribute that holds it.")},
      {QLatin1String("LOOKUP_CHOICE"), kConfig, kPlain,
       QLatin1String("One of the entries of the configuration, shown,stored separated by %.")},
      {QLatin1String("LOOKUP_CHOICE_OR_ATTR"), kConfig, kPlain,
       QLatin1String("One of the entries of the configuration, shown,stored separated by %, or an attribute "
                     "that holds it.")},
      {QLatin1String("LOOKUP_LISTBOX"), kConfig, kPlain,
       QLatin1String("Any of the entries of the configuration, shown,stored separated by %.")},
      {QLatin1String("LOOKUP_LISTBOX_OR_ATTR"), kConfig, kPlain,
       QLatin1String("Any of the entries of the configuration, shown,stored separated by %, or an attribute "
                     "that holds it.")},
      {QLatin1String("MESSAGE"), kNoConfig, kPlain,
       QLatin1String("A text to read, the prompt; it has no value.")},
      {QLatin1String("MULTIPARAMETER"), kConfig, kPlain,
       QLatin1String("Several parameters behind one; the configuration is the separator and the members' "
                     "prompt lines.")},
      {QLatin1String("NAMEDGROUP"), kConfig, kPlain,
       QLatin1String("A frame with a name that is the parameter's value; the configuration names its "
                     "parameters, separated by %.")},
      {QLatin1String("NAMEDGROUP NO_EDIT"), kConfig, kPlain,
       QLatin1String("A frame with a name that cannot be edited; the configuration names its parameters, "
                     "separated by %.")},
      {QLatin1String("NAMED_CONNECTION"), kConfig, kPlain,
       QLatin1String(
           "A stored connection to a service; the configuration lists the kinds offered, separated by %.")},
      {QLatin1String("NAMED_CONNECTION_ENCODED"), kConfig, kEncoded,
       QLatin1String("A stored connection to a service; the configuration lists the kinds offered, separated "
                     "by %; any characters.")},
      {QLatin1String("NAMED_DB_CONNECTION"), kConfig, kPlain,
       QLatin1String(
           "A stored connection to a database; the configuration lists the kinds offered, separated by %.")},
      {QLatin1String("NAMED_DB_CONNECTION_ENCODED"), kConfig, kEncoded,
       QLatin1String("A stored connection to a database; the configuration lists the kinds offered, "
                     "separated by %; any characters.")},
      {QLatin1String("NEW_ATTR"), kNoConfig, kPlain,
       QLatin1String("The name of an attribute that the transformer makes.")},
      {QLatin1String("NEW_ATTR_ENCODED"), kNoConfig, kEncoded,
       QLatin1String("The name of an attribute that the transformer makes; any characters.")},
      {QLatin1String("PASSWORD"), kNoConfig, kPlain,
       QLatin1String("A text that is not shown while it is typed.")},
      {QLatin1String("PASSWORD_ENCODED"), kNoConfig, kEncoded,
       QLatin1String("A text that is not shown while it is typed; any characters.")},
      {QLatin1String("PASSWORD_OR_ATTR_ENCODED"), kNoConfig, kEncoded,
       QLatin1String(
           "A text that is not shown while it is typed, or an attribute that holds it; any characters.")},
      {QLatin1String("PUBLISHED_PARAMETER"), kNoConfig, kPlain,
       QLatin1String("A parameter of the workspace.")},
      {QLatin1String("PUBLISHED_PARAMETER_LIST"), kNoConfig, kPlain,
       QLatin1String("Any number of parameters of the workspace, as references.")},
      {QLatin1String("RANGE_SLIDER"), kConfig, kPlain,
       QLatin1String("A number set with a slider; the configuration is smallest%largest%decimals.")},
      {QLatin1String("RANGE_SLIDER_OR_ATTR"), kConfig, kPlain,
       QLatin1String("A number set with a slider; the configuration is smallest%largest%decimals, or an "
                     "attribute that holds it.")},
      {QLatin1String("STRING"), kNoConfig, kPlain, QLatin1String("A text value.")},
      {QLatin1String("STRING_ENCODED"), kNoConfig, kEncoded, QLatin1String("A text value; any characters.")},
      {QLatin1String("STRING_OR_ATTR"), kNoConfig, kPlain,
       QLatin1String("A text value, or an attribute that holds it.")},
      {QLatin1String("STRING_OR_ATTR_ENCODED"), kNoConfig, kEncoded,
       QLatin1String("A text value, or an attribute that holds it; any characters.")},
      {QLatin1String("TEXT"), kNoConfig, kPlain, QLatin1String("One line of text.")},
      {QLatin1String("TEXT_EDIT"), kNoConfig, kEncoded, QLatin1String("Text of several lines.")},
      {QLatin1String("TEXT_EDIT_ENCODED"), kNoConfig, kEncoded, QLatin1String("Text of several lines.")},
      {QLatin1String("TEXT_EDIT_HTML"), kNoConfig, kEncoded, QLatin1String("HTML text.")},
      {QLatin1String("TEXT_EDIT_HTML_OR_ATTR"), kNoConfig, kEncoded,
       QLatin1String("HTML text, or an attribute that holds it.")},
      {QLatin1String("TEXT_EDIT_JSON"), kNoConfig, kEncoded, QLatin1String("JSON text.")},
      {QLatin1String("TEXT_EDIT_JSON_OR_ATTR"), kNoConfig, kEncoded,
       QLatin1String("JSON text, or an attribute that holds it.")},
      {QLatin1String("TEXT_EDIT_OR_ATTR"), kNoConfig, kEncoded,
       QLatin1String("Text of several lines, or an attribute that holds it.")},
      {QLatin1String("TEXT_EDIT_OR_ATTR_ENCODED"), kNoConfig, kEncoded,
       QLatin1String("Text of several lines, or an attribute that holds it.")},
      {QLatin1String("TEXT_EDIT_PYTHON"), kNoConfig, kEncoded, QLatin1String("A Python script.")},
      {QLatin1String("TEXT_EDIT_PYTHON_PARM"), kNoConfig, kEncoded,
       QLatin1String("A Python script that computes the parameter's value.")},
      {QLatin1String("TEXT_EDIT_R"), kNoConfig, kEncoded, QLatin1String("An R script.")},
      {QLatin1String("TEXT_EDIT_SQL"), kNoConfig, kEncoded, QLatin1String("SQL statements.")},
      {QLatin1String("TEXT_EDIT_SQL_OR_ATTR"), kNoConfig, kEncoded,
       QLatin1String("SQL statements, or an attribute that holds it.")},
      {QLatin1String("TEXT_EDIT_TCL"), kNoConfig, kEncoded, QLatin1String("A Tcl script.")},
      {QLatin1String("TEXT_EDIT_TCL_PARM"), kNoConfig, kEncoded,
       QLatin1String("A Tcl script that computes the parameter's value.")},
      {QLatin1String("TEXT_EDIT_XML"), kNoConfig, kEncoded, QLatin1String("XML text.")},
      {QLatin1String("TEXT_EDIT_XML_OR_ATTR"), kNoConfig, kEncoded,
       QLatin1String("XML text, or an attribute that holds it.")},
      {QLatin1String("TEXT_ENCODED"), kNoConfig, kEncoded,
       QLatin1String("One line of text; any characters.")},
      {QLatin1String("TEXT_OR_ATTR"), kNoConfig, kPlain,
       QLatin1String("One line of text, or an attribute that holds it.")},
      {QLatin1String("TEXT_OR_ATTR_ENCODED"), kNoConfig, kEncoded,
       QLatin1String("One line of text, or an attribute that holds it; any characters.")},
      {QLatin1String("TIME"), kNoConfig, kPlain, QLatin1String("A time of day.")},
      {QLatin1String("TIME_OR_ATTR"), kNoConfig, kPlain,
       QLatin1String("A time of day, or an attribute that holds it.")},
  };
  return types;
}

const GUITypeEntry* ORX_findGuiType(const QString& word) {
  const std::vector<GUITypeEntry>& types = ORX_guiTypes();
  const auto at =
      std::lower_bound(types.begin(), types.end(), word,
                       [](const GUITypeEntry& entry, const QString& w) { return entry.word < w; });
  return at != types.end() && at->word == word ? &*at : nullptr;
}
