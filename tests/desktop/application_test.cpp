#include "core/files.h"
#include "core/session.h"
#include "desktop/desktop_fixture.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

/// Cannot settle what is in it.
template <class Error>
class FailingWindow : public QWidget
{
protected:
    void closeEvent(QCloseEvent*) override { throw Error(u"gone"_s); }
};

class ApplicationTest : public DesktopTest
{
protected:
    template <class Error>
    void expect_to_stay(const QString& told)
    {
        FailingWindow<Error> failing;
        failing.show();
        place.dialogue.expect_box(told, u"gone"_s);
        EXPECT_FALSE(failing.close());
        EXPECT_TRUE(failing.isVisible());
    }
};

} // namespace

TEST_F(ApplicationTest, AWindowWhoseClosingFailsStaysAndSaysWhy)
{
    expect_to_stay<core::DatabaseError>(u"The database could not be read or written."_s);
    expect_to_stay<core::FileError>(u"A file could not be read or written."_s);
}

} // namespace kindrel::test
