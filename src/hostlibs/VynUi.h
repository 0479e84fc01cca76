#pragma once

#include "hostlibs/DexApi.h"

// The host's message service: the questions the library asks a user, such as whether an existing
// file may be overwritten.
namespace vyn_ui {

// Answers a question with IDYES (6) or IDNO (7). A host installs its own to put the question to the
// user; it is called from the thread of the run that asks (a worker thread for threaded runs).
class DEX_API IMsgUi {
 public:
  virtual ~IMsgUi();
  // text: the question, never null. flags: message-box style flags (0 for a plain question).
  virtual int question(const wchar_t* text, unsigned flags) = 0;
};

// The process-wide service: the one installed by setMsgUi, or the default, which answers IDNO to
// every question, so nothing is overwritten without a yes.
DEX_API IMsgUi& msg_ui();

// Installs the host's service; it is not owned and must outlive its use (including questions already
// being asked in worker threads when it is replaced). Null restores the default.
DEX_API void setMsgUi(IMsgUi* ui) noexcept;

}  // namespace vyn_ui
