// The search algorithms of the ICode's look-up table functions.
// The enumerations have a fixed underlying type, so that a value outside the named ones
// can be held and passed on.
#ifndef HUL_PLATFORM_ICODE_KV_SEARCHALGORITHM_H
#define HUL_PLATFORM_ICODE_KV_SEARCHALGORITHM_H

class KV_SearchAlgorithm {
public:
  enum SearchAlgorithm_etp : int {
    KV_SA_UNDEFINED = 0,
    KV_SA_LINEAR = 1,
    KV_SA_BINARY = 2,
    KV_SA_EQUIDISTANT = 3,
    KV_SA_LOCAL = 4,
    KV_SA_OTHER = 5
  };
};

#endif
