#include "hostlibs/VynUi.h"

#include <atomic>

#include "hostlibs/VynLogging.h"
#include "hostlibs/winport.h"

namespace vyn_ui {
namespace {

// Without a user to ask, the safe answer is no; the trace tells a reader of the log what was declined.
class DefaultMsgUi final : public IMsgUi {
 public:
  int question(const wchar_t* text, unsigned /*flags*/) override {
    VYN_TRACE_ALWAYS(L"question answered no: %ls", text != nullptr ? text : L"");
    return IDNO;
  }
};

constinit DefaultMsgUi defaultUi;
std::atomic<IMsgUi*> installedUi{nullptr};

}  // namespace

IMsgUi::~IMsgUi() = default;

IMsgUi& msg_ui() {
  IMsgUi* const installed = installedUi.load();
  return installed != nullptr ? *installed : defaultUi;
}

void setMsgUi(IMsgUi* ui) noexcept {
  installedUi.store(ui);
}

}  // namespace vyn_ui
