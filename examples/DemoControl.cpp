// Library frame: the option registration, the options dump, one message and one failed
// internal check going through the message server.
#include "DemoSections.h"

#include "HulCvTools/Control/KvCCodeGenMessage.h"
#include "HulCvTools/Control/KvCCvToolsControl.h"
#include "HulCvTools/Control/KvCCvToolsEnv.h"
#include "HulCvTools/Control/KvCCvToolsOptionsInterface.h"
#include "HulCvTools/Control/KvCInternalCheck.h"
#include "platform/support/KV_Dump.h"
#include "platform/support/KvCMessageServer.h"
#include "platform/support/KvCOptionValueStorage.h"
#include "platform/support/KvCSrcRefServer.h"

#include <sstream>
#include <string>

namespace {

struct KindCounts {
  int Bool = 0, Int = 0, UInt = 0, Double = 0, String = 0, MxArray = 0;
};

KindCounts countOptionKinds() {
  KindCounts counts;
#define HULCV_OPTION(Kind, Name) ++counts.Kind;
#include "HulCvTools/Control/KvCCvToolsOptions.def"
  return counts;
}

void showRegistration(DemoRun& run, KvCCvToolsOptionsInterface& options) {
  const int id = options.getInterfaceId();
  const KindCounts k = countOptionKinds();
  run.out << "options registered: " << run.storage.getNumberOfOptions(id) << " under interface id "
          << id << "\n"
          << "  by type: " << k.Bool << " bool, " << k.Int << " int, " << k.UInt
          << " unsigned int, " << k.Double << " double, " << k.String << " string, " << k.MxArray
          << " matrix\n";
}

void showOptionsDump(DemoRun& run, KvCCvToolsOptionsInterface& options) {
  options.setInlineMaxStatements(40);
  options.setInlineSmallFunctions(true);
  options.setRtosName("OSEK_DEMO");
  KV_Dump dump;
  options.dump(&dump, true);
  std::istringstream lines(dump.getText());
  std::string line;
  int shown = 0;
  int total = 0;
  run.out << "options dump (set: InlineMaxStatements, InlineSmallFunctions, RtosName):\n";
  while (std::getline(lines, line)) {
    ++total;
    const bool isSet = line.find("<unset>") == std::string::npos;
    if (total == 1 || (isSet && shown < 8)) {
      run.out << "  " << line << "\n";
      shown += total == 1 ? 0 : 1;
    }
  }
  run.out << "  (" << total << " lines in all)\n";
}

void printMessage(std::ostream& out, const KvCMessageRecord& m) {
  out << "  [" << m.number << ", severity " << static_cast<int>(m.severity) << ", "
      << m.category.str() << "] " << m.text.str() << "\n";
  if (!m.srcRefText.isEmpty())
    out << "    at " << m.srcRefText.str() << "\n";
}

void showMessages(DemoRun& run) {
  KvCMessageServer* server = KvCMessageServer::getMessageServer();
  server->clear();
  KvCSrcRefServer srcRefs;
  const KvCSrcRef* where = srcRefs.createModelSrcRef("demo/Controller/RTOS TickType");
  KvCCodeGenMessage::msg31688(where, "TickType", nullptr);

  server->setShowInternalInfo(true);
  KV_INTERNAL_CHECK("KvCDemo", 42);
  server->setShowInternalInfo(false);

  run.out << "messages received by the message server:\n";
  for (const KvCMessageRecord& m : server->getMessages())
    printMessage(run.out, m);
  run.out << "debug assertion reports: " << server->getDebugAssertions().size()
          << (KvCInternalCheck::hasDebugChecks() ? " (debug checks on)" : " (release build)")
          << "\n";
  server->clear();
}

} // namespace

void demoControl(DemoRun& run) {
  printSectionTitle(run.out, "Library frame: control, options, messages");
  KvCCvToolsOptionsInterface* options = run.control.getEnv()->getOptionsInterface();
  showRegistration(run, *options);
  showOptionsDump(run, *options);
  showMessages(run);
}
