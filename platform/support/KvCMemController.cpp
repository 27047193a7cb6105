#include "platform/support/KvCMemController.h"

#include <cstdlib>

KvCMemController* pKVMemory = nullptr;

KvCMemController::~KvCMemController() = default;

void* KvCMemController::allocMemBlock(std::size_t size) { return std::malloc(size ? size : 1); }

void KvCMemController::freeMemBlock(void* block) { std::free(block); }
