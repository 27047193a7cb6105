// KV_LogObj: what the ICode records about the logging of a signal: whether its time
// history is logged (otherwise only its extreme values are). A plain value object; the
// code generator owns it.
#ifndef HUL_PLATFORM_ICODE_KV_LOGOBJ_H
#define HUL_PLATFORM_ICODE_KV_LOGOBJ_H

class KV_LogObj {
public:
  explicit KV_LogObj(bool timeHistory = false) : timeHistoryLogged(timeHistory) {}

  bool isTimeHistoryLogged() const { return timeHistoryLogged; }
  void setTimeHistoryLogged(bool value) { timeHistoryLogged = value; }

private:
  bool timeHistoryLogged;
};

#endif
