#include "support/Text.h"
#include "tests/connection/Bench.h"

namespace zel {
namespace {

struct DoctorKeysTest : Connection {
    DoctorForm& form = forms.doctor;

    DoctorKeysTest() {
        platform.portProbe.known = {{"COM3", "", "", ""}};
        platform.portProbe.rights["COM3"] = {
            .exists = true, .terminal = true, .usable = true, .group = {}};
    }
};

TEST_F(DoctorKeysTest, MenuEntry_ExaminesAtOnceAndCloseEndsTheExamination) {
    bool examining = false;
    later(100, [&] {
        examining = form.Visible && form.Examining && !form.cmdRunAgain.Enabled;
        form.cmdClose.Click();
    });
    EXPECT_LE(time([this] { panel.UtilityDoctor.Click(); }), 200);
    EXPECT_TRUE(examining);
    EXPECT_FALSE(form.Visible);
    EXPECT_FALSE(form.Examining);
    EXPECT_FALSE(port.isOpen());
    EXPECT_FALSE(contains(form.FindingsBox.Text.get(), "fault"));
}

TEST_F(DoctorKeysTest, ExaminationToItsEnd_CountsTheFaults) {
    form.AddressBox.Text = "serial:COM3@57600";
    form.cmdRunAgain.Click();
    EXPECT_TRUE(contains(form.FindingsBox.Text.get(), "fault search: no instrument answers"));
    EXPECT_EQ(form.StatusLabel.Caption.get(), "Done. Faults found: 1.");
    EXPECT_TRUE(form.cmdRunAgain.Enabled);
    form.cmdCopy.Click();
    EXPECT_EQ(platform.clipboard.text(), form.FindingsBox.Text.get());
}

TEST_F(DoctorKeysTest, AddressThatIsNone_IsSaidAndNothingIsExamined) {
    form.AddressBox.Text = "nonsense";
    form.cmdRunAgain.Click();
    EXPECT_TRUE(contains(form.StatusLabel.Caption.get(), "serial:DEVICE@BAUD"));
    EXPECT_EQ(form.FindingsBox.Text.get(), "");
    EXPECT_EQ(port.written(), "");
}

}  // namespace
}  // namespace zel
