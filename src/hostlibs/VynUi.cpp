#include "hostlibs/VynUi.h"

#include <atomic>

#include "hostlibs/winport.h"

namespace vyn_ui {
namespace {

// Without a user to ask, the safe answer is no: nothing is overwritten unattended.
class DefaultMsgUi final : public IMsgUi {
 public:
  int question(const wchar_t* /*text*/, unsigned /*flags*/) override { return IDNO; }
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
