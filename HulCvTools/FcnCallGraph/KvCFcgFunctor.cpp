#include "HulCvTools/FcnCallGraph/KvCFcgFunctor.h"

KvCFcgFunctor::~KvCFcgFunctor() = default;

bool KvCFcgFunctor::stopIteration() { return false; }
