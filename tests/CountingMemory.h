// Installs a counting memory controller as the run's controller for the scope of a test,
// so the test can prove that every block taken is given back.
#ifndef HUL_TESTS_COUNTINGMEMORY_H
#define HUL_TESTS_COUNTINGMEMORY_H

#include "platform/support/KvCCountingMemController.h"
#include "platform/support/KvCMemController.h"

class CountingMemory {
public:
  CountingMemory() { pKVMemory = &controller; }
  ~CountingMemory() { pKVMemory = nullptr; }
  CountingMemory(const CountingMemory&) = delete;
  CountingMemory& operator=(const CountingMemory&) = delete;
  KvCCountingMemController controller;
};

#endif
