#include "GUI/Panes/CWgtPane3SlidersImpl.h"

#include "PaneFixture.h"
#include "support/BoxRecorder.h"

#include <gtest/gtest.h>

using namespace orvela;

TEST(CWgtPane3SlidersImpl, ReportsAModeOfAnotherPane) {
    std::unique_ptr<Shown<CWgtPane3SlidersImpl>> three;
    CUserParams params;
    EXPECT_EQ(boxes([&] { three = std::make_unique<Shown<CWgtPane3SlidersImpl>>(Mode_FinalTouch); }),
              QStringList("Note:|invalid mode in CWgtPane3SlidersImpl::setSliders"));
    EXPECT_EQ(boxes([&] { three->pane->applyGUIParams(params); }),
              QStringList("Note:|invalid mode in CWgtPane3SlidersImpl::applyGUIParams"));
}
