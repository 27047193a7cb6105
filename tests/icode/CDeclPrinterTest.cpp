// The C declaration printer: the text of a header with named numerical and pointer types
// and extern variables, and a compile of printed headers with the system C compiler that
// also checks each typedef's width and signedness against the ICode type.
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KV_DataTypeServer.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KV_NumericalTypeServer.h"
#include "platform/icode/KV_PointerTypeServer.h"
#include "platform/icode/KvCCDeclPrinter.h"
#include "platform/icode/KvCIcFileId.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <sstream>
#include <string>
#include <unistd.h>
#include <vector>

namespace {

struct Header {
  AppBuilder app;
  KV_DataTypeServer* dts = app.factories().getDataTypeServer();
  KV_PointerTypeServer* pts = dts->getPointerServer();
  KV_DimensionDescriptor scalar;

  KV_NumericalType* named(const char* name, KV_NumericalType* base, bool typedefFlag = true,
                          const KV_DimensionDescriptor* dims = nullptr) {
    WmCXString description("fixture");
    KV_DimensionDescriptor d = dims ? *dims : scalar;
    return app.factories().getNumTypeServer()->getNonDDMappedNumerical(name, description, *base, d,
                                                                       typedefFlag, nullptr, true);
  }
  KV_PointerType* namedPointer(const char* name, KV_PointerType* target) {
    WmCXString description("fixture");
    return pts->getNonDDMappedPointer(name, description, scalar, true, target, nullptr);
  }
  void define(KvCIcFileId* file, KV_DataType* type, bool append = true) {
    ASSERT_TRUE(file->getFile()->defineType(type, nullptr, append));
  }
  // An extern declaration of a new variable in `file` (which becomes the current file).
  void declare(KvCIcFileId* file, const char* name, KV_DataType* type) {
    app.file(file->getName().c_str());
    app.fileScope().stmt(app.varDecl(app.variable(name, type, false)));
  }
};

TEST(CDeclPrinterTest, HeaderWritesTypedefsInOrderAndSpellsOutWhatIsNotVisible) {
  Header h;
  KvCIcFileId* osek = h.app.file("osek-api.h");
  KvCIcFileId* other = h.app.file("other.h");
  KV_NumericalType* status = h.named("StatusType", h.dts->getUInt8());
  KV_NumericalType* mask = h.named("EventMaskType", h.dts->getUInt32());
  KV_PointerType* maskRef =
      h.namedPointer("EventMaskRefType", h.dts->demandPointerType(mask, false));
  KV_PointerType* access = h.namedPointer("AccessNameRef", h.pts->getVoidPointer());
  KV_NumericalType* dummy = h.named("ISRDummyType", h.dts->getInt8(), false);
  KV_DimensionDescriptor dims;
  dims.addDimension(2);
  dims.addDimension(3);
  KV_NumericalType* matrix = h.named("Matrix", h.dts->getFloat32(), true, &dims);
  KV_NumericalType* tick = h.named("TickType", h.dts->getUInt16());
  h.define(osek, status);
  h.define(osek, maskRef); // before its target's typedef: spelled out
  h.define(osek, mask);
  h.define(osek, access);
  h.define(osek, dummy); // no typedef
  h.define(osek, matrix);
  h.define(osek, tick, false); // in front
  h.define(other,
           h.dts->registerDataDictionaryType("Counter", nullptr, true, true, nullptr, nullptr));
  h.declare(osek, "status", status);
  h.declare(osek, "isr", dummy);
  h.declare(osek, "events", h.dts->demandPointerType(maskRef, true));
  h.declare(osek, "rows", h.dts->demandPointerType(matrix, false));
  h.declare(osek, "counts", h.dts->demandArrayType(h.dts->getInt16(), 4));
  h.declare(
      osek, "spelled",
      h.dts->demandPointerType(h.dts->demandPointerType(h.dts->findType("Counter"), false), false));

  const char* expected = "#ifndef OSEK_API_H\n"
                         "#define OSEK_API_H\n"
                         "\n"
                         "typedef unsigned short TickType;\n"
                         "typedef unsigned char StatusType;\n"
                         "typedef unsigned int* EventMaskRefType;\n"
                         "typedef unsigned int EventMaskType;\n"
                         "typedef void* AccessNameRef;\n"
                         "typedef float Matrix[2][3];\n"
                         "\n"
                         "extern StatusType status;\n"
                         "extern signed char isr;\n"
                         "extern const EventMaskRefType* events;\n"
                         "extern Matrix* rows;\n"
                         "extern short counts[4];\n"
                         "extern int** spelled;\n"
                         "\n"
                         "#endif\n";
  EXPECT_EQ(KvCCDeclPrinter::printFile(osek).str(), expected);
  EXPECT_EQ(KvCCDeclPrinter::printFile(other).str(),
            "#ifndef OTHER_H\n#define OTHER_H\n\ntypedef int Counter;\n\n#endif\n");
  EXPECT_EQ(KvCCDeclPrinter::getIncludeGuard("9lives.h").str(), "FILE_9LIVES_H");

  // Declarators of types spelled out: pointers to arrays need parentheses.
  KvCCDeclPrinter fresh;
  EXPECT_EQ(fresh.declare(h.dts->demandPointerType(matrix, false), "p").str(), "float (*p)[2][3]");
  EXPECT_EQ(
      fresh.declare(h.dts->demandArrayType(h.dts->demandPointerType(status, true), 5), "q").str(),
      "const unsigned char* q[5]");
  EXPECT_EQ(fresh.declare(maskRef, "").str(), "unsigned int*");
}

// Where `cc` is in PATH, or empty.
std::string findCCompiler() {
  const char* path = std::getenv("PATH");
  std::stringstream dirs(path ? path : "");
  for (std::string dir; std::getline(dirs, dir, ':');) {
    std::filesystem::path candidate = std::filesystem::path(dir.empty() ? "." : dir) / "cc";
    if (::access(candidate.c_str(), X_OK) == 0)
      return candidate.string();
  }
  return {};
}

TEST(CDeclPrinterTest, PrintedHeadersCompileAsC99WithTheModelsWidths) {
  const std::string cc = findCCompiler();
  if (cc.empty())
    GTEST_SKIP() << "no C compiler (cc) in PATH";

  Header h;
  KvCIcFileId* osek = h.app.file("osek.h");
  KvCIcFileId* acme = h.app.file("acme.h");
  // Every base type under a name of its own, in the first header.
  std::vector<KV_NumericalType*> numericals;
  for (KV_NumericalType* base : {h.dts->getInt8(), h.dts->getUInt8(), h.dts->getInt16(),
                                 h.dts->getUInt16(), h.dts->getInt32(), h.dts->getUInt32(),
                                 h.dts->getFloat32(), h.dts->getFloat64(), h.dts->getBool()}) {
    std::string name = "T" + base->getName().str();
    numericals.push_back(h.named(name.c_str(), base));
    h.define(osek, numericals.back());
  }
  KV_NumericalType* mask = h.named("EventMaskType", h.dts->getUInt32());
  KV_PointerType* maskRef =
      h.namedPointer("EventMaskRefType", h.dts->demandPointerType(mask, false));
  KV_PointerType* access = h.namedPointer("AccessNameRef", h.pts->getVoidPointer());
  KV_PointerType* constRef = h.namedPointer("ConstMaskRef", h.dts->demandPointerType(mask, true));
  KV_DimensionDescriptor dims;
  dims.addDimension(3);
  KV_NumericalType* triple = h.named("Triple", mask, true, &dims);
  for (KV_DataType* type : std::vector<KV_DataType*>{mask, maskRef, access, constRef, triple})
    h.define(osek, type);
  h.declare(osek, "eventMask", mask);
  h.declare(osek, "eventRefs", h.dts->demandArrayType(maskRef, 2));
  // The second header names the first one's types only through their structure, and a
  // typedef of its own made from one of them.
  KV_NumericalType* isr = h.named("ISRDummyType", numericals[0]);
  h.define(acme, isr);
  h.declare(acme, "isrId", isr);
  h.declare(acme, "lastMask", h.dts->demandPointerType(maskRef, false));

  namespace fs = std::filesystem;
  const fs::path dir = fs::temp_directory_path() / ("hul_cdecl_" + std::to_string(::getpid()));
  fs::create_directories(dir);
  for (KvCIcFileId* file : {osek, acme})
    std::ofstream(dir / file->getName().str()) << KvCCDeclPrinter::printFile(file).str();

  // Each header twice (the guard), a width and signedness check per numerical typedef
  // (an array of negative size where the model and C disagree), and a use of every type.
  std::ostringstream c;
  c << "#include \"osek.h\"\n#include \"acme.h\"\n#include \"osek.h\"\n#include \"acme.h\"\n";
  for (KV_NumericalType* n : numericals) {
    const std::string name = n->getName().str();
    c << "typedef char width_" << name << "[sizeof(" << name << ") * 8 == " << n->getBits()
      << " ? 1 : -1];\n";
    if (!n->isFloat())
      c << "typedef char sign_" << name << "[((" << name
        << ")-1 < 0) == " << (n->isSigned() ? 1 : 0) << " ? 1 : -1];\n";
  }
  c << "int use(void) {\n";
  for (KV_NumericalType* n : numericals)
    c << "  " << n->getName().str() << " v_" << n->getName().str() << " = 1;\n";
  c << "  EventMaskRefType ref = &eventMask;\n"
       "  ConstMaskRef constRef = ref;\n"
       "  AccessNameRef any = ref;\n"
       "  Triple triple = {1, 2, 3};\n"
       "  ISRDummyType id = isrId;\n"
       "  TInt8* sameType = &id;\n"
       "  EventMaskType* same = eventRefs[1];\n"
       "  lastMask = &eventRefs[0];\n"
       "  return (int)(*constRef + triple[2] + *same + *sameType) + (any != 0)";
  for (KV_NumericalType* n : numericals)
    c << " + (int)v_" << n->getName().str();
  c << ";\n}\n";
  std::ofstream(dir / "use.c") << c.str();

  const std::string command = cc + " -std=c99 -Wall -Werror -fsyntax-only -I " + dir.string() +
                              " " + (dir / "use.c").string() + " > " + (dir / "cc.log").string() +
                              " 2>&1";
  const int status = std::system(command.c_str());
  std::ifstream log(dir / "cc.log");
  std::string output((std::istreambuf_iterator<char>(log)), std::istreambuf_iterator<char>());
  EXPECT_EQ(status, 0) << command << "\n"
                       << output << "\nosek.h:\n"
                       << KvCCDeclPrinter::printFile(osek).str() << "\nacme.h:\n"
                       << KvCCDeclPrinter::printFile(acme).str() << "\nuse.c:\n"
                       << c.str();
  fs::remove_all(dir);
}

} // namespace
