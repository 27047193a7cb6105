// The look-up methods of the ICode's look-up table functions.
// The enumerations have a fixed underlying type, so that a value outside the named ones
// can be held and passed on.
#ifndef HUL_PLATFORM_ICODE_KV_LOOKUPMETHOD_H
#define HUL_PLATFORM_ICODE_KV_LOOKUPMETHOD_H

class KV_LookUpMethod {
public:
  enum LookUpMethod_etp : int {
    KV_LUM_UNDEFINED = 0,
    KV_LUM_INTERPOLATION = 1,
    KV_LUM_EXTRAPOLATION = 2,
    KV_LUM_BELOW = 3,
    KV_LUM_ABOVE = 4,
    KV_LUM_NEAREST = 5
  };
};

#endif
