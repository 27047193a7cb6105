// KvCCodeGenMessage: the message functions through which the library reports to the
// code generator's message server. Each message number has one function; its parameters
// are the source reference (where the message has one) and then the text's arguments in
// the order of the format's placeholders.
//
// Every function formats into the one process-wide buffer MSG_Buffer (16384 bytes) with
// a bounded print: a null string argument prints as "_NULL_", and a text that does not
// fit is cut so that it ends in " ..." at the very end of the buffer (16383 characters).
// The buffer is not locked; messages must not be emitted from two threads at once.
#ifndef HULCVTOOLS_CONTROL_KVCCODEGENMESSAGE_H
#define HULCVTOOLS_CONTROL_KVCCODEGENMESSAGE_H

#include "HulCvTools/HulCvToolsExport.h"

#include <cstddef>

class KvCSrcRef;

class HULCV_API KvCCodeGenMessage {
public:
  static constexpr std::size_t MSG_BufferSize = 16384;
  static char MSG_Buffer[MSG_BufferSize];

  // Internal error (severity 3, "General Messages"): code and number of the place.
  static void msg10007(const char* errorCode, int number);
  static void msg10008(const KvCSrcRef* srcRef, const char* errorCode, int number);
  // Counter alarm messages (severity 2): the RTOS name.
  static void msg21272(const KvCSrcRef* srcRef, const char* rtosName);
  static void msg21273(const KvCSrcRef* srcRef, const char* rtosName);
  static void msg21274(const KvCSrcRef* srcRef, const char* rtosName);
  // RTOS messages.
  static void msg30179(const KvCSrcRef* srcRef, const char* functionName);
  static void msg30243(const KvCSrcRef* srcRef, const char* functionOrMacroName);
  static void msg31688(const KvCSrcRef* srcRef, const char* dataTypeName,
                       const char* differingProperties);
  static void msg32300(const KvCSrcRef* srcRef, const char* templateName);

private:
  KvCCodeGenMessage() = delete;
};

#endif
