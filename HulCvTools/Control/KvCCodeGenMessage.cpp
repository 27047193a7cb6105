#include "HulCvTools/Control/KvCCodeGenMessage.h"

#include "platform/support/KvCMessageServer.h"

#include <cstdarg>
#include <cstdio>
#include <cstring>

char KvCCodeGenMessage::MSG_Buffer[KvCCodeGenMessage::MSG_BufferSize];

namespace {

constexpr const char* kGeneral = "General Messages";
constexpr const char* kCounterAlarm = "Counter Alarm Block Messages";
constexpr const char* kRtos = "RTOS Messages";
constexpr const char* kInternalError =
    "Internal error. Error code: %s %d. Contact Velmora's technical support team.";

const char* orNull(const char* text) { return text ? text : "_NULL_"; }

// Formats into MSG_Buffer (marking a cut text with " ..." at its end) and hands the
// message to the message server.
__attribute__((format(printf, 5, 6))) void emit(tagERR_error_severity_etp severity, int number,
                                                const KvCSrcRef* srcRef, const char* category,
                                                const char* format, ...) {
  constexpr std::size_t size = KvCCodeGenMessage::MSG_BufferSize;
  char* buffer = KvCCodeGenMessage::MSG_Buffer;
  va_list args;
  va_start(args, format);
  const int needed = std::vsnprintf(buffer, size, format, args);
  va_end(args);
  if (needed < 0)
    buffer[0] = '\0';
  else if (static_cast<std::size_t>(needed) >= size)
    std::memcpy(buffer + size - 5, " ...", 5);
  KvCMessageServer::getMessageServer()->putMessage(severity, number, srcRef, category, buffer);
}

} // namespace

void KvCCodeGenMessage::msg10007(const char* errorCode, int number) {
  emit(ERR_SEVERITY_FATAL, 10007, nullptr, kGeneral, kInternalError, orNull(errorCode), number);
}

void KvCCodeGenMessage::msg10008(const KvCSrcRef* srcRef, const char* errorCode, int number) {
  emit(ERR_SEVERITY_FATAL, 10008, srcRef, kGeneral, kInternalError, orNull(errorCode), number);
}

void KvCCodeGenMessage::msg21272(const KvCSrcRef* srcRef, const char* rtosName) {
  emit(ERR_SEVERITY_ERROR, 21272, srcRef, kCounterAlarm,
       "CounterAlarm: No function kind to get the CounterValue is specified for the currently "
       "selected RTOS %s. Because of this, the CounterValue block output cannot be used and "
       "should therefore be connected with a Terminator block.",
       orNull(rtosName));
}

void KvCCodeGenMessage::msg21273(const KvCSrcRef* srcRef, const char* rtosName) {
  emit(ERR_SEVERITY_ERROR, 21273, srcRef, kCounterAlarm,
       "CounterAlarm: No function kind to get the CounterValue from an ISR is specified for "
       "the currently selected RTOS %s. Because of this, the CounterValue block output cannot "
       "be used from an ISR.",
       orNull(rtosName));
}

void KvCCodeGenMessage::msg21274(const KvCSrcRef* srcRef, const char* rtosName) {
  emit(ERR_SEVERITY_ERROR, 21274, srcRef, kCounterAlarm,
       "CounterAlarm: No function kind to initialize the counter is specified for the "
       "currently selected RTOS %s. Use the 'Omit counter initialization' option.",
       orNull(rtosName));
}

void KvCCodeGenMessage::msg30179(const KvCSrcRef* srcRef, const char* functionName) {
  emit(ERR_SEVERITY_ERROR, 30179, srcRef, kRtos,
       "The number of arguments for the user-defined function %s differ.", orNull(functionName));
}

void KvCCodeGenMessage::msg30243(const KvCSrcRef* srcRef, const char* functionOrMacroName) {
  emit(ERR_SEVERITY_ERROR, 30243, srcRef, kRtos,
       "Function template for user-defined function or macro %s missing",
       orNull(functionOrMacroName));
}

void KvCCodeGenMessage::msg31688(const KvCSrcRef* srcRef, const char* dataTypeName,
                                 const char* differingProperties) {
  emit(ERR_SEVERITY_WARNING, 31688, srcRef, kRtos,
       "The RTOS data type %s is specified in the RTOSInfo file and also in the Data "
       "Dictionary. The data type from the Data Dictionary will be used. The two "
       "specifications differ in the following properties: %s",
       orNull(dataTypeName), orNull(differingProperties));
}

void KvCCodeGenMessage::msg32300(const KvCSrcRef* srcRef, const char* templateName) {
  emit(ERR_SEVERITY_WARNING, 32300, srcRef, kRtos,
       "At least one FileSpecification object of the module has EmitFile set to 'on' and is "
       "referenced by RTOS function template %s. The EmitFile property is ignored.",
       orNull(templateName));
}
