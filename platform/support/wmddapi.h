// The Data Dictionary's enumerations, as its programming interface declares them: the
// properties of types and symbols that the code generator exchanges with the Data
// Dictionary. Only the enumerations are here; the Data Dictionary's objects and functions
// are not part of this stand-in. Every enumeration is a 32-bit signed value.
#ifndef HUL_PLATFORM_SUPPORT_WMDDAPI_H
#define HUL_PLATFORM_SUPPORT_WMDDAPI_H

#include <cstdint>

namespace wmddapi {

enum AlignmentEnum : std::int32_t {
  ALIGNMENT_SPECIAL_8 = -8,
  ALIGNMENT_SPECIAL_4 = -4,
  ALIGNMENT_SPECIAL_2 = -2,
  ALIGNMENT_UNDEFINED = -1,
  ALIGNMENT_1_BYTE = 1,
  ALIGNMENT_2_BYTES = 2,
  ALIGNMENT_4_BYTES = 4,
  ALIGNMENT_8_BYTES = 8,
  ALIGNMENT_16_BYTES = 16
};

enum ByteOrderEnum : std::int32_t {
  BYTE_ORDER_TARGET_DEFAULT = -2,
  BYTE_ORDER_UNDEFINED = -1,
  BYTE_ORDER_LITTLE_ENDIAN = 0,
  BYTE_ORDER_BIG_ENDIAN = 1
};

// BASE_TYPE_OTHER stands for every type without a base type of its own in the Data
// Dictionary, the signed 64 bit integer among them.
enum BaseTypeEnum : std::int32_t {
  BASE_TYPE_INT8 = 1,
  BASE_TYPE_UINT8 = 2,
  BASE_TYPE_INT16 = 3,
  BASE_TYPE_UINT16 = 4,
  BASE_TYPE_INT32 = 5,
  BASE_TYPE_UINT32 = 6,
  BASE_TYPE_FLOAT32 = 7,
  BASE_TYPE_FLOAT64 = 8,
  BASE_TYPE_POINTER = 9,
  BASE_TYPE_BOOL = 10,
  BASE_TYPE_ARRAY = 11,
  BASE_TYPE_STRUCT = 12,
  BASE_TYPE_UNION = 13,
  BASE_TYPE_ENUM = 14,
  BASE_TYPE_VOID = 15,
  BASE_TYPE_OTHER = 16,
  BASE_TYPE_UINT64 = 17
};

enum VariableClassInfoEnum : std::int32_t {
  VARIABLE_CLASS_INFO_NONE = 0,
  VARIABLE_CLASS_INFO_READONLY = 1,
  VARIABLE_CLASS_INFO_READWRITE = 2,
  VARIABLE_CLASS_INFO_ADJUSTABLE = 3,
  VARIABLE_CLASS_INFO_OFFLINE_READWRITE = 4
};

enum StorageClassEnum : std::int32_t {
  STORAGE_CLASS_DEFAULT = 0,
  STORAGE_CLASS_STATIC = 1,
  STORAGE_CLASS_EXTERN = 2
};

enum ScopeEnum : std::int32_t {
  SCOPE_LOCAL = 1,
  SCOPE_GLOBAL = 2,
  SCOPE_VALUE_PARAM = 3,
  SCOPE_REF_PARAM = 4,
  SCOPE_FCN_RETURN = 5,
  SCOPE_STRUCT_COMPONENT = 6
};

enum FunctionKindEnum : std::int32_t {
  FUNCTION_KIND_STEP = 1,
  FUNCTION_KIND_INIT = 2,
  FUNCTION_KIND_TERM = 3,
  FUNCTION_KIND_AUX = 4,
  FUNCTION_KIND_RESTART = 5,
  FUNCTION_KIND_AP_ENTRY = 6,
  FUNCTION_KIND_AP_EXIT = 7,
  FUNCTION_KIND_STARTUP = 8
};

enum LoggingModeEnum : std::int32_t { LOGGING_MODE_TIME_HISTORY = 1, LOGGING_MODE_MIN_MAX = 2 };

enum SearchMethodEnum : std::int32_t {
  SEARCH_METHOD_LINEAR = 1,
  SEARCH_METHOD_BINARY = 2,
  SEARCH_METHOD_EQUIDISTANT = 3,
  SEARCH_METHOD_LOCAL = 4,
  SEARCH_METHOD_OTHER = 5
};

enum OutputModeEnum : std::int32_t {
  OUTPUT_MODE_HELD = 1,
  OUTPUT_MODE_RESET = 2,
  OUTPUT_MODE_OTHER = 3
};

enum InitializeStatesEnum : std::int32_t {
  INITIALIZE_STATES_HELD = 1,
  INITIALIZE_STATES_RESET = 2
};

enum LookupMethodEnum : std::int32_t {
  LOOKUP_METHOD_INTERPOLATION = 1,
  LOOKUP_METHOD_OTHER = 2,
  LOOKUP_METHOD_BELOW = 3,
  LOOKUP_METHOD_ABOVE = 4,
  LOOKUP_METHOD_NEAREST = 5
};

} // namespace wmddapi

#endif
