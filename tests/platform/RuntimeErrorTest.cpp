#include <Zandor/platform/RuntimeError.h>

#include <gtest/gtest.h>

#include <new>
#include <stdexcept>

using namespace zandor;

using platform::currentError;
using platform::RuntimeError;
namespace errors = platform::errors;

namespace {

template <class Thrown>
RuntimeError asReported(Thrown&& thrown) {
    try {
        throw std::forward<Thrown>(thrown);
    } catch (...) {
        return currentError();
    }
}

} // namespace

TEST(RuntimeErrors, HaveTheNumbersAndTextsOfTheClassicRuntime) {
    struct Row {
        RuntimeError error;
        std::int32_t number;
        platform::String description;
    };
    const Row rows[] = {
        {errors::invalidProcedureCall(), 5, u"Invalid procedure call or argument"},
        {errors::overflow(), 6, u"Overflow"},
        {errors::outOfMemory(), 7, u"Out of memory"},
        {errors::subscriptOutOfRange(), 9, u"Subscript out of range"},
        {errors::divisionByZero(), 11, u"Division by zero"},
        {errors::typeMismatch(), 13, u"Type mismatch"},
        {errors::objectNotSet(), 91, u"Object variable or With block variable not set"},
        {errors::noSuchElement(17), 340, u"Control array element '17' doesn't exist"},
        {errors::noSuchElement(-1), 340, u"Control array element '-1' doesn't exist"},
        {errors::alreadyLoaded(), 360, u"Object already loaded"},
        {errors::cannotUnloadDesignElement(), 362, u"Can't unload controls created at design time"},
        {errors::invalidPropertyValue(), 380, u"Invalid property value"},
        {errors::invalidPropertyArrayIndex(), 381, u"Invalid property array index"},
        {errors::unsupportedMember(), 438, u"Object doesn't support this property or method"},
        {errors::automation(u"The server is gone"), 440, u"The server is gone"},
        {errors::duplicateKey(), 457,
         u"This key is already associated with an element of this collection"},
        {errors::invalidRow(), 30009, u"Invalid Row value"},
        {errors::invalidCol(), 30010, u"Invalid Col value"},
    };
    for (const Row& row : rows) {
        EXPECT_EQ(row.error.Number, row.number);
        EXPECT_EQ(row.error.Description, row.description);
    }
}

TEST(TheCurrentError, IsTheRuntimeErrorThrown) {
    const RuntimeError error = asReported(RuntimeError{-2147467259, u"Unspecified error"});
    EXPECT_EQ(error.Number, -2147467259);
    EXPECT_EQ(error.Description, u"Unspecified error");
}

TEST(TheCurrentError, IsOutOfMemoryAfterAFailedAllocation) {
    EXPECT_EQ(asReported(std::bad_alloc()).Number, 7);
    EXPECT_EQ(asReported(std::bad_array_new_length()).Number, 7);
}

TEST(TheCurrentError, TakesTheTextOfAHostsOwnException) {
    const RuntimeError error = asReported(std::runtime_error("caf\xC3\xA9 closed"));
    EXPECT_EQ(error.Number, 440);
    EXPECT_EQ(error.Description, u"caf\u00E9 closed");
}

TEST(TheCurrentError, CoversAnythingElseThrown) {
    const RuntimeError error = asReported(42);
    EXPECT_EQ(error.Number, 440);
    EXPECT_EQ(error.Description, u"Automation error");
}
