#include <tests/registry/AwkwardDefinitions.h>

std::vector<QByteArray> awkwardDefinitions() {
  const QByteArray end = "TEMPLATE_START\nx $(P)\nTEMPLATE_END\n";
  const auto named = [](const char* name) { return QByteArray("TRANSFORMER_NAME: ") + name + '\n'; };
  return {
      named("Two") + end + "VERSION: 2\n" + named("Two") + end,
      // A byte order mark counts at the start of a file alone.
      "\xEF\xBB\xBF" + named("Marked") + end + "\xEF\xBB\xBF" + named("NoKeyword") + "VERSION: 3\n" + end,
      named("Returns").replace('\n', "\r\n") + "VERSION: 1\r\nTEMPLATE_START\r\n y \r\nTEMPLATE_END\r\n",
      "# one\n" + named("Comments") + "# two\nCATEGORY:A , B,,A\n#TEMPLATE_START\n" + end + "# three\n",
      // White space and letters that are not ASCII, whole and broken.
      "\xC2\xA0TRANSFORMER_NAME:\xC2\xA0Wide\xE2\x80\x83\n\xC2\xA0TEMPLATE_START\n\xC2\xA0TEMPLATE_"
      "END\n\xC2\xA0z"
      "\xC2\xA0\nTEMPLATE_END\xC2\xA0\n" +
          named("Wide") + "VERSION: 2\n" + end,
      named("Broken\xC3\xA4\xC3") + "VERSION: 1\xC3 \nALIASES: \xff \xC3\n\xC3\n" + end,
      named("Values") + "VERSION 4\nVERSION: x\nVISIBLE: no\nVISIBLE: maybe\nTAG_MAPPING: I:A=B\n" + end,
      named("Far") + "VERSION:99999999999\nALIASES:Two Old\nTAG_MAPPING I:A=B\n" + end,
      named("Blocks") + "DESCRIPTION_START\nVERSION: 9\n\n# a\nTEMPLATE_START\nDESCRIPTION_END\n" +
          "ALIASES: <BLANK> Old Newer\nCHANGE_LOG_START\nfirst\nCHANGE_LOG_END\n" + end,
      "CATEGORY_DESCRIPTION_START  G \n" + end + "CATEGORY_DESCRIPTION_END\n" + named("Categories") +
          "CATEGORY_DESCRIPTION_STARTH\nVERSION: 5\nCATEGORY_DESCRIPTION_END\nCATEGORY: G\n" + end,
      named("Complete") + end + named("Endless") + "TEMPLATE_START\n TEMPLATE_END\nnever ends",
      named("Closed") + end + named("Open") + "TOOLTIP_START\n" + end,
      named("Depends") + "DEPENDENCY: orx_env ORX_AWKWARD\nTEMPLATE_STARTS\nTEMPLATE_START x\n" +
          end.chopped(1),
      QByteArray("\0TRANSFORMER_NAME: A\nVERSION: 2\n", 33) + named("Nul") + end,
      "TEMPLATE_START\nTEMPLATE_END\n" + named("AfterNameless") + "TEMPLATE_START\nTEMPLATE_END",
      named("Parameters") +
          "PARAMETER_NAME: P\nPARAMETER_TYPE: CHOICE a%b\nPARAMETER_PROMPT: Size\nPARAMETER_DEFAULT: b\n"
          "PARAMETER_NAME: Q\nINPUT_TAGS: <NO_INPUT>\nOUTPUT_TAGS: O\nTAG_DESCRIPTION O: out\n"
          "MULTIPROCESS: Q\nTOOLTIP_START\nis $(P)\nTOOLTIP_END\n" +
          end,
  };
}
