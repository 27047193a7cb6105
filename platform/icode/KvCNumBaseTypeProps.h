// The properties of a numerical base type that the ICode keeps as its own enumerations:
// the alignment (numbered 0 to 4 for 1, 2, 4, 8 and 16 bytes, with three negative
// special values) and the byte order.
// The enumerations have a fixed underlying type, so that a value outside the named ones
// can be held and passed on.
#ifndef HUL_PLATFORM_ICODE_KVCNUMBASETYPEPROPS_H
#define HUL_PLATFORM_ICODE_KVCNUMBASETYPEPROPS_H

class KvCNumBaseTypeProps {
public:
  enum KvTAlignment : int {
    KV_ALIGN_SPECIAL_8 = -8,
    KV_ALIGN_SPECIAL_4 = -4,
    KV_ALIGN_SPECIAL_2 = -2,
    KV_ALIGN_1 = 0,
    KV_ALIGN_2 = 1,
    KV_ALIGN_4 = 2,
    KV_ALIGN_8 = 3,
    KV_ALIGN_16 = 4
  };

  enum KvTByteOrder : int {
    KV_BYTE_ORDER_TARGET_DEFAULT = 0,
    KV_BYTE_ORDER_UNDEFINED = 1,
    KV_BYTE_ORDER_LITTLE_ENDIAN = 2,
    KV_BYTE_ORDER_BIG_ENDIAN = 3
  };
};

#endif
