#include "HulCvTools/ElocQuery/KvCCvDDBaseState.h"

#include <gtest/gtest.h>

namespace {

struct Expected {
  bool onlyDD, onlyModel, both, inDD, inModel;
};

void expectState(const KvCCvDDBaseState& s, Expected e) {
  EXPECT_EQ(s.isOnlyDD(), e.onlyDD);
  EXPECT_EQ(s.isOnlyModel(), e.onlyModel);
  EXPECT_EQ(s.isOnlyModelAndDD(), e.both);
  EXPECT_EQ(s.isSpecifiedInDD(), e.inDD);
  EXPECT_EQ(s.isSpecifiedInModel(), e.inModel);
}

TEST(DDBaseStateTest, SettersAndPredicatesAgree) {
  KvCCvDDBaseState s(KvCCvDDBaseState::KV_DDBASE_ONLY_DD);
  expectState(s, {true, false, false, true, false});
  s.setToOnlyModel();
  expectState(s, {false, true, false, false, true});
  s.setToModelAndDD();
  expectState(s, {false, false, true, true, true});
  s.setToOnlyDD();
  expectState(s, {true, false, false, true, false});
  EXPECT_EQ(sizeof(KvCCvDDBaseState), 4u);
}

TEST(DDBaseStateTest, UpdateFromTheModelTurnsOnlyDictionaryIntoBoth) {
  KvCCvDDBaseState onlyDD(KvCCvDDBaseState::KV_DDBASE_ONLY_DD);
  onlyDD.updateWithModelSpecification();
  EXPECT_TRUE(onlyDD.isOnlyModelAndDD());
  KvCCvDDBaseState onlyModel(KvCCvDDBaseState::KV_DDBASE_ONLY_MODEL);
  onlyModel.updateWithModelSpecification();
  EXPECT_TRUE(onlyModel.isOnlyModel());
  KvCCvDDBaseState both(KvCCvDDBaseState::KV_DDBASE_MODEL_AND_DD);
  both.updateWithModelSpecification();
  EXPECT_TRUE(both.isOnlyModelAndDD());
}

} // namespace
