// The output modes of the ICode's conditionally executed subsystems: what an output holds
// while the subsystem is not executed.
// The enumerations have a fixed underlying type, so that a value outside the named ones
// can be held and passed on.
#ifndef HUL_PLATFORM_ICODE_KVNOUTPUTMODE_H
#define HUL_PLATFORM_ICODE_KVNOUTPUTMODE_H

namespace KvNOutputMode {
enum KvEOutputMode : int { KV_OUTPUT_HELD = 0, KV_OUTPUT_RESET = 1, KV_OUTPUT_UNDEFINED = 2 };
} // namespace KvNOutputMode

#endif
