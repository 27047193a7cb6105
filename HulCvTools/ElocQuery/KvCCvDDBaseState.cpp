#include "HulCvTools/ElocQuery/KvCCvDDBaseState.h"

static_assert(sizeof(KvCCvDDBaseState) == 4, "the state is one 32-bit value");

KvCCvDDBaseState::KvCCvDDBaseState(tagKvEDDBaseState initialState) : ddBaseState(initialState) {}

void KvCCvDDBaseState::setToOnlyDD() { ddBaseState = KV_DDBASE_ONLY_DD; }

void KvCCvDDBaseState::setToOnlyModel() { ddBaseState = KV_DDBASE_ONLY_MODEL; }

void KvCCvDDBaseState::setToModelAndDD() { ddBaseState = KV_DDBASE_MODEL_AND_DD; }

void KvCCvDDBaseState::updateWithModelSpecification() {
  if (isOnlyDD())
    setToModelAndDD();
}

bool KvCCvDDBaseState::isOnlyDD() const { return ddBaseState == KV_DDBASE_ONLY_DD; }

bool KvCCvDDBaseState::isOnlyModel() const { return ddBaseState == KV_DDBASE_ONLY_MODEL; }

bool KvCCvDDBaseState::isOnlyModelAndDD() const { return ddBaseState == KV_DDBASE_MODEL_AND_DD; }

bool KvCCvDDBaseState::isSpecifiedInDD() const { return isOnlyModelAndDD() || isOnlyDD(); }

bool KvCCvDDBaseState::isSpecifiedInModel() const { return isOnlyModelAndDD() || isOnlyModel(); }
