// Fixtures for the inline symbol database tests: an application with scalar variables and
// structure instances, and the internal checks the database reported.
#ifndef HULCV_TESTS_INLINESYMBOLDB_INLINESYMBOLDBFIXTURE_H
#define HULCV_TESTS_INLINESYMBOLDB_INLINESYMBOLDBFIXTURE_H

#include "platform/builder/AppBuilder.h"
#include "tests/Control/MessageServerFixture.h"

#include <string>
#include <vector>

class InlineSymbolDbFixture : public MessageServerFixture {
protected:
  KvCUnparamSymbol* scalar(const char* name) { return app.variable(name, app.int16()); }

  // The error codes ("KvCInlineSymbolDb 220") of the internal checks reported, in order.
  static std::vector<std::string> internalChecks() {
    std::vector<std::string> codes;
    const std::string lead = "Internal error. Error code: ";
    for (const KvCMessageRecord& m : messages()) {
      if (m.number != 10007)
        continue;
      const std::string& text = m.text.str();
      const std::size_t end = text.find(". Contact");
      codes.push_back(text.substr(lead.size(), end - lead.size()));
    }
    return codes;
  }

  AppBuilder app;
};

#endif
