// KvCIcFile: the properties of one generated file: whether it is a stub or artificial,
// its code generation basis, who is responsible for it, its top-level statement table,
// its complementary file (the header of a source file and vice versa), its code unit and
// the types it defines, in definition order. A file whose name ends in ".h" is a header;
// every other file is a source file.
//
// A file is part of its file id (getFileId), which owns it. A type is defined in at most
// one file, its module file; the file points to the types it defines, which the data type
// server owns. Fixtures can make defineType fail (setDefineTypeFails).
#ifndef HUL_PLATFORM_ICODE_KVCICFILE_H
#define HUL_PLATFORM_ICODE_KVCICFILE_H

#include "platform/support/HulPlatformExport.h"

#include <unordered_set>
#include <vector>

class KV_DataType;
class KvCCStmTable;
class KvCIcCodeUnit;
class KvCIcFileId;
class KvCSrcRef;

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
  explicit KvCIcFile(KvCIcFileId* owner) : fileId(owner) {}
  KvCIcFile(const KvCIcFile&) = delete;
  KvCIcFile& operator=(const KvCIcFile&) = delete;

  KvCIcFileId* getFileId() const { return fileId; }
  bool isStubFile() const { return stub; }
  void setStubFile(bool value) { stub = value; }
  bool isArtificial() const { return artificial; }
  void setArtificial(bool value) { artificial = value; }
  tagKvECodegenBase getCodegenBase() const { return codegenBase; }
  void setCodegenBase(tagKvECodegenBase base) { codegenBase = base; }
  tagKvEFileResponsibility getResponsibility() const { return responsibility; }
  void setResponsibility(tagKvEFileResponsibility r) { responsibility = r; }
  KvCCStmTable* getStatementTable() const { return table; }
  // The top-level statement table (the same as getStatementTable).
  KvCCStmTable* getStt() const { return table; }
  void setStatementTable(KvCCStmTable* t) { table = t; }
  KvCIcFileId* getComplementaryFile() const { return complementary; }
  void setComplementaryFile(KvCIcFileId* file) { complementary = file; }
  // The code unit the file was added to (KvCIcCodeUnit::addFile), or null.
  KvCIcCodeUnit* getCodeUnit() const { return codeUnit; }
  // Whether the file is a header (its name ends in ".h").
  bool isHeaderFile() const;

  // Declares `type` in this file and makes the file the type's module file. `append`: the
  // type comes after the types defined so far, else before them (for a type that earlier
  // definitions must be able to use). True also when the type is defined here already
  // (nothing changes then). False, and nothing changed, for a null type, a type defined
  // in another file, or when the fixture made the operation fail. `srcRef` is the
  // caller's and is not kept. O(1) when appending, O(defined types) otherwise.
  bool defineType(KV_DataType* type, const KvCSrcRef* srcRef, bool append);
  bool isTypeDefined(const KV_DataType* type) const { return definedSet.count(type) != 0; }
  // The types defined here, in definition order.
  const std::vector<KV_DataType*>& getDefinedTypes() const { return definedTypes; }
  // Fixture switch: while set, defineType answers false and records nothing.
  void setDefineTypeFails(bool fails) { defineTypeFails = fails; }

  // Emit marks. Force-emit: the user asked that the file be written even if the code
  // generator would leave it out. Do-not-emit because of a special function template: the
  // file belongs to a user function template, so the code generator writes nothing into
  // it. The marks are independent; setting one does not clear the other.
  bool isMarkedAsForceEmit() const { return forceEmit; }
  void markAsForceEmit() { forceEmit = true; }
  bool isMarkedAsDoNotEmitCauseSpecialFunctionTempl() const { return doNotEmitSpecialTempl; }
  void markAsDoNotEmitCauseSpecialFunctionTempl() { doNotEmitSpecialTempl = true; }

  // Where the file was asked for, or null. Not owned.
  const KvCSrcRef* getSourceRef() const { return sourceRef; }
  void setSourceRef(const KvCSrcRef* ref) { sourceRef = ref; }

private:
  friend class KvCIcCodeUnit; // sets the upward link

  KvCIcFileId* fileId;
  KvCIcCodeUnit* codeUnit = nullptr;
  bool stub = false;
  bool artificial = false;
  tagKvECodegenBase codegenBase = KV_CODEGEN_BASE_MODEL;
  tagKvEFileResponsibility responsibility = KV_FILE_RESPONSIBILITY_GENERATOR;
  KvCCStmTable* table = nullptr;
  KvCIcFileId* complementary = nullptr;
  std::vector<KV_DataType*> definedTypes;
  std::unordered_set<const KV_DataType*> definedSet;
  bool defineTypeFails = false;
  bool forceEmit = false;
  bool doNotEmitSpecialTempl = false;
  const KvCSrcRef* sourceRef = nullptr;
};

#endif
