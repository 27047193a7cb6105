// KvCIcFile: the properties of one generated file: whether it is a stub or artificial,
// its code generation basis, who is responsible for it, its top-level statement table
// and its complementary file (the header of a source file and vice versa).
#ifndef HUL_PLATFORM_ICODE_KVCICFILE_H
#define HUL_PLATFORM_ICODE_KVCICFILE_H

#include "platform/support/HulPlatformExport.h"

class KvCCStmTable;
class KvCIcFileId;

enum tagKvECodegenBase {
  KV_CODEGEN_BASE_MODEL = 0,
  KV_CODEGEN_BASE_MIXED = 1,
  KV_CODEGEN_BASE_DD = 2 // generated from the data dictionary
};

enum tagKvEFileResponsibility {
  KV_FILE_RESPONSIBILITY_GENERATOR = 0,
  KV_FILE_RESPONSIBILITY_USER = 1 // the user provides or maintains the file
};

class HUL_PLATFORM_API KvCIcFile {
public:
  bool isStubFile() const { return stub; }
  void setStubFile(bool value) { stub = value; }
  bool isArtificial() const { return artificial; }
  void setArtificial(bool value) { artificial = value; }
  tagKvECodegenBase getCodegenBase() const { return codegenBase; }
  void setCodegenBase(tagKvECodegenBase base) { codegenBase = base; }
  tagKvEFileResponsibility getResponsibility() const { return responsibility; }
  void setResponsibility(tagKvEFileResponsibility r) { responsibility = r; }
  KvCCStmTable* getStatementTable() const { return table; }
  void setStatementTable(KvCCStmTable* t) { table = t; }
  KvCIcFileId* getComplementaryFile() const { return complementary; }
  void setComplementaryFile(KvCIcFileId* file) { complementary = file; }

private:
  bool stub = false;
  bool artificial = false;
  tagKvECodegenBase codegenBase = KV_CODEGEN_BASE_MODEL;
  tagKvEFileResponsibility responsibility = KV_FILE_RESPONSIBILITY_GENERATOR;
  KvCCStmTable* table = nullptr;
  KvCIcFileId* complementary = nullptr;
};

#endif
