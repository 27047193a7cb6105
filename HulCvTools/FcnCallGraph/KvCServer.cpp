#include "HulCvTools/FcnCallGraph/KvCServer.h"

#include "HulCvTools/ModelInterfaces/ViewModel.h"

// The keyed server of signals, instantiated and exported here once.
template class KvCServerEntry<int, KvCSignal>;
template class KvCServer<int, KvCSignal>;
