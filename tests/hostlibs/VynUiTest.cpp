#include "hostlibs/VynUi.h"

#include <gtest/gtest.h>

#include <atomic>
#include <string>
#include <thread>

#include "hostlibs/winport.h"
#include "support/LogCapture.h"

namespace {

// A host service that answers as told and remembers the last question.
class ScriptedUi final : public vyn_ui::IMsgUi {
 public:
  explicit ScriptedUi(int answer) : answer_(answer) {}
  int question(const wchar_t* text, unsigned flags) override {
    lastText = text;
    lastFlags = flags;
    ++asked;
    return answer_;
  }

  std::wstring lastText;
  unsigned lastFlags = 0xFFFFFFFFu;
  int asked = 0;

 private:
  const int answer_;
};

// Every test leaves the default service in place.
class VynUi : public ::testing::Test {
 protected:
  void TearDown() override { vyn_ui::setMsgUi(nullptr); }
};

}  // namespace

TEST_F(VynUi, DefaultServiceAnswersNoSilently) {
  const dex_test::LogCapture capture;
  EXPECT_EQ(vyn_ui::msg_ui().question(L"File /tmp/a.xml already exists. Overwrite?", 0), IDNO);
  EXPECT_EQ(capture.size(), 0u);
}

TEST_F(VynUi, DefaultServiceCopesWithANullText) {
  const dex_test::LogCapture capture;
  EXPECT_EQ(vyn_ui::msg_ui().question(nullptr, 0), IDNO);
}

TEST_F(VynUi, InstalledServiceIsAskedWithTheTextAndFlags) {
  ScriptedUi yes(IDYES);
  vyn_ui::setMsgUi(&yes);
  EXPECT_EQ(&vyn_ui::msg_ui(), &yes);
  EXPECT_EQ(vyn_ui::msg_ui().question(L"Overwrite?", MB_YESNO), IDYES);
  EXPECT_EQ(yes.asked, 1);
  EXPECT_EQ(yes.lastText, L"Overwrite?");
  EXPECT_EQ(yes.lastFlags, MB_YESNO);
}

TEST_F(VynUi, NullRestoresTheDefaultService) {
  const dex_test::LogCapture capture;
  ScriptedUi yes(IDYES);
  vyn_ui::setMsgUi(&yes);
  vyn_ui::setMsgUi(nullptr);
  EXPECT_NE(&vyn_ui::msg_ui(), &yes);
  EXPECT_EQ(vyn_ui::msg_ui().question(L"Overwrite?", 0), IDNO);
  EXPECT_EQ(yes.asked, 0);
}

TEST_F(VynUi, ServiceMayBeSwappedWhileAnotherThreadAsks) {
  ScriptedUi yes(IDYES);
  ScriptedUi no(IDNO);
  std::atomic<bool> stop{false};
  std::atomic<int> unexpected{0};
  vyn_ui::setMsgUi(&no);
  std::thread asker([&] {
    while (!stop) {
      const int answer = vyn_ui::msg_ui().question(L"?", 0);
      if (answer != IDYES && answer != IDNO) ++unexpected;
    }
  });
  for (int i = 0; i < 1000; ++i)
    vyn_ui::setMsgUi(i % 2 == 0 ? &yes : &no);
  stop = true;
  asker.join();
  EXPECT_EQ(unexpected.load(), 0);
}
