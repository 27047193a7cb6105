// KvCCvDDBaseState: where an object of the model is specified: only in the data
// dictionary, only in the model, or in both. The owner of the object chooses the initial
// value; the state then changes only through the setters and through
// updateWithModelSpecification, which turns "only the data dictionary" into "both" and
// leaves the two other values alone.
#ifndef HULCVTOOLS_ELOCQUERY_KVCCVDDBASESTATE_H
#define HULCVTOOLS_ELOCQUERY_KVCCVDDBASESTATE_H

#include "HulCvTools/HulCvToolsExport.h"

#include <cstdint>

class HULCV_API KvCCvDDBaseState {
public:
  enum tagKvEDDBaseState : std::int32_t {
    KV_DDBASE_ONLY_DD = 0,
    KV_DDBASE_ONLY_MODEL = 1,
    KV_DDBASE_MODEL_AND_DD = 2
  };

  // Without an initial state the object counts as specified only in the model.
  explicit KvCCvDDBaseState(tagKvEDDBaseState initialState = KV_DDBASE_ONLY_MODEL);

  void setToOnlyDD();
  void setToOnlyModel();
  void setToModelAndDD();
  // The model now specifies the object too.
  void updateWithModelSpecification();

  bool isOnlyDD() const;
  bool isOnlyModel() const;
  bool isOnlyModelAndDD() const;
  bool isSpecifiedInDD() const;
  bool isSpecifiedInModel() const;

private:
  tagKvEDDBaseState ddBaseState;
};

#endif
