// Ecp servers: for a sample with two access points, the object-identifier macros, the four
// access-point macros (with the auxiliary macros they expand through) and the ECU service
// function are made in the ICode; the model's printer shows the headers, and a small
// expander follows the printed macros step by step the way the C preprocessor does.
#include "DemoSampleApp.h"
#include "DemoSections.h"

#include "HulCvTools/EcpTools/KvCEcpParamSymbolServer.h"
#include "HulCvTools/EcpTools/KvCEcpSymbolServer.h"
#include "HulCvTools/EcpTools/KvCEcpTypeServer.h"
#include "platform/icode/KV_DataType.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KvCCDeclPrinter.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCIcFileServer.h"
#include "platform/icode/KvCParamSymbol.h"
#include "platform/icode/KvCUnparamSymbol.h"
#include "platform/view/KvCIvData.h"

#include <cctype>
#include <map>
#include <sstream>
#include <string>
#include <vector>

namespace {

void printIndented(std::ostream& out, const std::string& text) {
  std::istringstream lines(text);
  for (std::string line; std::getline(lines, line);)
    if (!line.empty())
      out << "    " << line << "\n";
}

// Function-like macros read back from a printed header, and one expansion step at a time:
// the first macro call of a token list is replaced by its body, with its arguments fully
// expanded first except next to ##, and the pastes done. A paste whose result is not one
// token leaves the two tokens side by side, as the C preprocessor does after its report.
class MacroExpander {
public:
  explicit MacroExpander(const std::string& header) {
    std::istringstream lines(header);
    for (std::string line; std::getline(lines, line);)
      addDefinition(line);
  }

  // The expansion steps of `text`, the text itself first; `invalidPastes` counts the pastes
  // that did not form a token.
  std::vector<std::string> expand(const std::string& text, int& invalidPastes) const {
    std::vector<std::string> steps{text};
    Tokens tokens = tokenize(text);
    invalidPastes = 0;
    while (expandFirstCall(tokens, invalidPastes))
      steps.push_back(join(tokens));
    return steps;
  }

private:
  using Tokens = std::vector<std::string>;
  struct Macro {
    std::vector<std::string> params;
    Tokens body;
  };

  static bool isIdentifier(const std::string& token) {
    if (token.empty() || std::isdigit(static_cast<unsigned char>(token[0])))
      return false;
    for (char c : token)
      if (!std::isalnum(static_cast<unsigned char>(c)) && c != '_')
        return false;
    return true;
  }

  static Tokens tokenize(const std::string& text) {
    Tokens tokens;
    for (std::size_t i = 0; i < text.size();) {
      const auto c = static_cast<unsigned char>(text[i]);
      if (std::isspace(c)) {
        ++i;
      } else if (std::isalnum(c) || c == '_') {
        std::size_t end = i;
        while (end < text.size() &&
               (std::isalnum(static_cast<unsigned char>(text[end])) || text[end] == '_'))
          ++end;
        tokens.push_back(text.substr(i, end - i));
        i = end;
      } else if (text.compare(i, 2, "##") == 0) {
        tokens.emplace_back("##");
        i += 2;
      } else {
        tokens.emplace_back(1, text[i++]);
      }
    }
    return tokens;
  }

  static std::string join(const Tokens& tokens) {
    std::string text;
    for (std::size_t i = 0; i < tokens.size(); ++i) {
      const bool words = i > 0 && isIdentifier(tokens[i - 1]) && isIdentifier(tokens[i]);
      const bool comma = i > 0 && tokens[i - 1] == ",";
      text += (words || comma ? " " : "") + tokens[i];
    }
    return text;
  }

  void addDefinition(const std::string& line) {
    const std::string prefix = "#define ";
    if (line.compare(0, prefix.size(), prefix) != 0)
      return;
    const std::size_t open = line.find('(');
    const std::size_t close = line.find(')');
    const std::size_t space = line.find(' ', prefix.size());
    if (open == std::string::npos || close == std::string::npos || space < open)
      return; // an object-like macro or the include guard
    Macro macro;
    for (const std::string& token : tokenize(line.substr(open + 1, close - open - 1)))
      if (token != ",")
        macro.params.push_back(token);
    macro.body = tokenize(line.substr(close + 1));
    macros[line.substr(prefix.size(), open - prefix.size())] = macro;
  }

  // Splits the arguments of the call whose "(" is at `open`; the index after its ")".
  static std::size_t arguments(const Tokens& tokens, std::size_t open, std::vector<Tokens>& args) {
    args.assign(1, Tokens());
    int depth = 0;
    for (std::size_t i = open + 1; i < tokens.size(); ++i) {
      if (tokens[i] == ")" && depth == 0)
        return i + 1;
      if (tokens[i] == "," && depth == 0) {
        args.emplace_back();
        continue;
      }
      depth += tokens[i] == "(" ? 1 : tokens[i] == ")" ? -1 : 0;
      args.back().push_back(tokens[i]);
    }
    return tokens.size();
  }

  Tokens fullyExpanded(Tokens tokens, int& invalidPastes) const {
    while (expandFirstCall(tokens, invalidPastes)) {
    }
    return tokens;
  }

  Tokens substitute(const Macro& macro, const std::vector<Tokens>& args, int& invalidPastes) const {
    Tokens result;
    for (std::size_t i = 0; i < macro.body.size(); ++i) {
      const std::string& token = macro.body[i];
      std::size_t param = 0;
      while (param < macro.params.size() && macro.params[param] != token)
        ++param;
      if (param == macro.params.size() || param >= args.size()) {
        result.push_back(token);
        continue;
      }
      const bool pasted = (i > 0 && macro.body[i - 1] == "##") ||
                          (i + 1 < macro.body.size() && macro.body[i + 1] == "##");
      const Tokens arg = pasted ? args[param] : fullyExpanded(args[param], invalidPastes);
      result.insert(result.end(), arg.begin(), arg.end());
    }
    Tokens pasted;
    for (std::size_t i = 0; i < result.size(); ++i) {
      if (result[i] == "##" && !pasted.empty() && i + 1 < result.size()) {
        const std::string joined = pasted.back() + result[i + 1];
        if (isIdentifier(joined))
          pasted.back() = joined;
        else {
          ++invalidPastes;
          pasted.push_back(result[i + 1]);
        }
        ++i;
        continue;
      }
      pasted.push_back(result[i]);
    }
    return pasted;
  }

  bool expandFirstCall(Tokens& tokens, int& invalidPastes) const {
    for (std::size_t i = 0; i + 1 < tokens.size(); ++i) {
      auto macro = macros.find(tokens[i]);
      if (macro == macros.end() || tokens[i + 1] != "(")
        continue;
      std::vector<Tokens> args;
      const std::size_t end = arguments(tokens, i + 1, args);
      Tokens replacement = substitute(macro->second, args, invalidPastes);
      tokens.erase(tokens.begin() + static_cast<std::ptrdiff_t>(i),
                   tokens.begin() + static_cast<std::ptrdiff_t>(end));
      tokens.insert(tokens.begin() + static_cast<std::ptrdiff_t>(i), replacement.begin(),
                    replacement.end());
      return true;
    }
    return false;
  }

  std::map<std::string, Macro> macros;
};

} // namespace

void demoEcp(DemoRun& run) {
  printSectionTitle(run.out, "Ecp access points");
  KvCCodeViewData& data = run.sample.app.data();
  KV_ICodeFactoryContainer* factories = data.getFactoryContainer();
  KvCIvData view;
  KvCEcpTypeServer types;
  KvCEcpSymbolServer symbols;
  types.bootPhaseOne(&data, factories, true);
  symbols.bootPhaseOne(factories->getMacroSymbolServer(), &types, &data, factories, &view, true);
  if (!types.bootPhaseTwo() || !symbols.bootPhaseTwo()) {
    run.out << "  the Ecp servers could not boot\n";
    return;
  }
  run.out << "  object identifiers:";
  for (const char* name : {"CID_Throttle", "CID_Lambda"}) {
    KvCUnparamSymbol* cid = symbols.createCidMacro(name, nullptr);
    run.out << " " << (cid ? cid->getName().str() : std::string("(none)"));
  }
  KV_DataType* apRef = types.demandAccessPointRefType(nullptr);
  run.out << "\n  access point references are " << (apRef ? apRef->getName().str() : "(none)");

  auto* params = new KvCEcpParamSymbolServer;
  if (!params) {
    run.out << "\n  out of memory\n";
    return;
  }
  params->boot(&types, factories);
  using Demand = KvCParamSymbol* (KvCEcpParamSymbolServer::*)(const KvCSrcRef*);
  run.out << "\n  access-point macros:";
  for (Demand demand :
       {&KvCEcpParamSymbolServer::demandApWriteMacro, &KvCEcpParamSymbolServer::demandApReadMacro,
        &KvCEcpParamSymbolServer::demandApEntryMacro,
        &KvCEcpParamSymbolServer::demandApExitMacro}) {
    KvCParamSymbol* macro = (params->*demand)(nullptr);
    run.out << " " << (macro ? macro->getName().str() : std::string("(none)"));
  }
  KvCParamSymbol* service = params->demandEcuServiceFunction(nullptr);
  run.out << "\n  ECU service function: " << (service ? service->getName().str() : "(none)")
          << (service && params->demandEcuServiceFunction(nullptr) == service ? " (found again)"
                                                                              : "")
          << "\n";
  delete params; // shuts down: the inserters and accesses go back to the memory controller

  KvCIcFileServer* files = data.getFileServer();
  std::string apHeader;
  for (const char* name : {"ecp_ap.h", "wmecu.h", "acme.h"}) {
    KvCIcFileId* file = files->findFile(name);
    if (!file)
      continue;
    const std::string text = KvCCDeclPrinter::printFile(file).str();
    if (apHeader.empty())
      apHeader = text;
    run.out << "  " << name << " as printed:\n";
    printIndented(run.out, text);
  }
  MacroExpander expander(apHeader);
  for (const char* use : {"ap_Write(Throttle, u)", "ap_Entry(Lambda)"}) {
    int invalidPastes = 0;
    const std::vector<std::string> steps = expander.expand(use, invalidPastes);
    run.out << "  expansion of " << use << ":\n";
    for (std::size_t i = 1; i < steps.size(); ++i)
      run.out << "    -> " << steps[i] << "\n";
    if (invalidPastes > 0)
      run.out << "    (" << invalidPastes
              << " paste of a name with \"(\" forms no token: the preprocessor reports it and "
                 "keeps the two apart)\n";
  }
  symbols.shutdown();
  types.shutdown();
}
