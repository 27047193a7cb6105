// A real client of the Ecp servers' output: the access-point header as the model's C
// printer writes it, run through the system C preprocessor together with uses of the four
// access-point macros, and the headers with the dummy types, the CID macros and the ECU
// service function compiled together with code that uses them.
//
// ap_Write and ap_Read expand through AP_EXPAND_CONCAT(ap_Write_x, (v)), which pastes the
// pasted name with the bracket that AP_BRACKET made: "ap_Write_x" and "(" do not form one
// preprocessing token. The preprocessor reports that and writes the two tokens side by
// side, so the expansion is still ap_Write_x(v). The tests assert on that report.
#include "HulCvTools/EcpTools/KvCEcpParamSymbolServer.h"
#include "HulCvTools/EcpTools/KvCEcpSymbolServer.h"
#include "HulCvTools/EcpTools/KvCEcpTypeServer.h"
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KvCCDeclPrinter.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCIcFileServer.h"
#include "platform/support/KvCMessageServer.h"
#include "platform/view/KvCIvData.h"

#include <gtest/gtest.h>

#include <cctype>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <sstream>
#include <string>
#include <unistd.h>

namespace {

namespace fs = std::filesystem;

std::string withoutSpace(const std::string& text) {
  std::string result;
  for (char c : text)
    if (!std::isspace(static_cast<unsigned char>(c)))
      result += c;
  return result;
}

std::string readFile(const fs::path& path) {
  std::ifstream in(path);
  return std::string(std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>());
}

bool haveCompiler() { return std::system("command -v cc > /dev/null 2>&1") == 0; }

class EcpPrintedHeaderTest : public ::testing::Test {
protected:
  void SetUp() override {
    KvCMessageServer::getMessageServer()->clear();
    types.bootPhaseOne(&app.data(), &app.factories(), true);
    ASSERT_TRUE(types.bootPhaseTwo());
    symbols.bootPhaseOne(app.factories().getMacroSymbolServer(), &types, &app.data(),
                         &app.factories(), &view, true);
    ASSERT_TRUE(symbols.bootPhaseTwo());
    ASSERT_TRUE(params.boot(&types, &app.factories()));
    // A directory of this process's own: other tests write files of the same names.
    dir = fs::temp_directory_path() / ("hul_ecp_" + std::to_string(::getpid()));
    fs::create_directories(dir);
  }
  void TearDown() override {
    std::error_code ignored;
    fs::remove_all(dir, ignored);
  }

  void demandEverything() {
    ASSERT_NE(params.demandApWriteMacro(nullptr), nullptr);
    ASSERT_NE(params.demandApReadMacro(nullptr), nullptr);
    ASSERT_NE(params.demandApEntryMacro(nullptr), nullptr);
    ASSERT_NE(params.demandApExitMacro(nullptr), nullptr);
    ASSERT_NE(params.demandEcuServiceFunction(nullptr), nullptr);
    ASSERT_NE(types.demandAccessPointRefType(nullptr), nullptr);
    ASSERT_NE(symbols.createCidMacro("CID_Engine", nullptr), nullptr);
    ASSERT_NE(symbols.createCidMacro("CID_Brake", nullptr), nullptr);
  }
  std::string printed(const char* fileName) {
    return KvCCDeclPrinter::printFile(app.data().getFileServer()->findFile(fileName)).str();
  }
  void writeHeaders() {
    for (const char* name : {"ecp_ap.h", "acme.h", "wmecu.h"})
      std::ofstream(dir / name) << printed(name);
  }
  // Preprocesses one use of the header; `out` and `err` receive the output and the
  // diagnostics. The exit status of cc.
  int preprocess(const std::string& use, std::string& out, std::string& err) {
    std::ofstream(dir / "use.c") << "#include \"ecp_ap.h\"\n" << use << "\n";
    const std::string command = "cc -E -P -I" + dir.string() + " " + (dir / "use.c").string() +
                                " > " + (dir / "use.i").string() + " 2> " +
                                (dir / "use.err").string();
    const int status = std::system(command.c_str());
    out = readFile(dir / "use.i");
    err = readFile(dir / "use.err");
    return status;
  }

  AppBuilder app;
  KvCIvData view;
  KvCEcpTypeServer types;
  KvCEcpSymbolServer symbols;
  KvCEcpParamSymbolServer params;
  fs::path dir;
};

TEST_F(EcpPrintedHeaderTest, AccessPointHeaderDefinesEveryMacroBeforeAnythingElse) {
  demandEverything();
  EXPECT_EQ(printed("ecp_ap.h"),
            "#ifndef ECP_AP_H\n"
            "#define ECP_AP_H\n"
            "\n"
            "#define AP_EXPAND_BRACKET(name) (name)\n"
            "#define AP_BRACKET(name) AP_EXPAND_BRACKET(name)\n"
            "#define AP_EXPAND_CONCAT(name1, name2) name1##name2\n"
            "#define AP_CONCAT(name1, name2) AP_EXPAND_CONCAT(name1, name2)\n"
            "#define ap_Write(arg1, arg2) AP_CONCAT(AP_CONCAT(ap_Write_, arg1), AP_BRACKET(arg2))\n"
            "#define ap_Read(arg1, arg2) AP_CONCAT(AP_CONCAT(ap_Read_, arg1), AP_BRACKET(arg2))\n"
            "#define ap_Entry(arg1) AP_CONCAT(ap_Entry_, arg1)()\n"
            "#define ap_Exit(arg1) AP_CONCAT(ap_Exit_, arg1)()\n"
            "\n"
            "#endif\n");
}

TEST_F(EcpPrintedHeaderTest, PreprocessorExpandsEveryAccessPointMacro) {
  if (!haveCompiler())
    GTEST_SKIP() << "no C compiler (cc) found";
  demandEverything();
  writeHeaders();
  const struct {
    const char* use;
    const char* expansion;
    bool pastesBracket; // the expansion pastes a name with "(": the preprocessor reports it
  } rows[] = {{"ap_Write(x, v)", "ap_Write_x(v)", true},
              {"ap_Read(y, w)", "ap_Read_y(w)", true},
              {"ap_Entry(z)", "ap_Entry_z()", false},
              {"ap_Exit(z)", "ap_Exit_z()", false}};
  for (const auto& row : rows) {
    SCOPED_TRACE(row.use);
    std::string out;
    std::string err;
    const int status = preprocess(row.use, out, err);
    EXPECT_EQ(withoutSpace(out), withoutSpace(row.expansion)) << out;
    if (row.pastesBracket) {
      EXPECT_NE(err.find("pasting"), std::string::npos) << err;
      EXPECT_NE(err.find("preprocessing token"), std::string::npos) << err;
    } else {
      EXPECT_EQ(status, 0) << err;
      EXPECT_EQ(err, "");
    }
  }
}

TEST_F(EcpPrintedHeaderTest, HeadersWithTypesMacrosAndTheServiceFunctionCompile) {
  if (!haveCompiler())
    GTEST_SKIP() << "no C compiler (cc) found";
  demandEverything();
  writeHeaders();
  std::ofstream(dir / "client.c")
      << "#include \"acme.h\"\n#include \"wmecu.h\"\n#include \"ecp_ap.h\"\n#include \"acme.h\"\n"
         "void ap_Entry_engine(void);\n"
         "void ap_Exit_engine(void);\n"
         "static signed char ids[2] = {CID_Engine, CID_Brake};\n"
         "void step(void) {\n"
         "  AccessPointRef ref = (AccessPointRef)&ids[0];\n"
         "  ap_Entry(engine);\n"
         "  wmecu_service(CID_Engine);\n"
         "  wmecu_service(*(signed char*)ref);\n"
         "  ap_Exit(engine);\n"
         "}\n";
  const std::string command = "cc -std=c99 -Wall -Wextra -Werror -fsyntax-only -I" + dir.string() +
                              " " + (dir / "client.c").string();
  EXPECT_EQ(std::system(command.c_str()), 0) << command << "\n"
                                             << printed("acme.h") << printed("wmecu.h");
}

} // namespace
