// Properties of variable and function classes that the ICode keeps as its own
// enumerations: the access information of a variable class and the inline request of a
// function class.
// The enumerations have a fixed underlying type, so that a value outside the named ones
// can be held and passed on.
#ifndef HUL_PLATFORM_ICODE_KVCSMBCLASSPROPS_H
#define HUL_PLATFORM_ICODE_KVCSMBCLASSPROPS_H

// How calibration and measurement tools may access a variable of the class.
enum tagKvEVcAcAccessInfo : int {
  KV_VC_AC_UNDEFINED = 0,
  KV_VC_AC_NONE = 1,
  KV_VC_AC_READONLY = 2,
  KV_VC_AC_READWRITE = 3,
  KV_VC_AC_ADJUSTABLE = 4,
  KV_VC_AC_OFFLINE_READWRITE = 5
};

// Whether and how the functions of the class are inlined.
enum tagKvEFcInline : int {
  KV_FC_INLINE_DEFAULT = 0,
  KV_FC_INLINE_INLINE = 1,
  KV_FC_INLINE_NOINLINE = 2,
  KV_FC_INLINE_FORCE_INLINE = 3
};

#endif
