#include <Zandor/platform/Ref.h>

#include <gtest/gtest.h>

using namespace zandor;

using platform::makeRef;
using platform::Ref;

namespace {

struct Counted {
    explicit Counted(int value) : value(value) {}
    int value;
};

struct Derived : Counted {
    using Counted::Counted;
};

} // namespace

TEST(AReferenceToNothing, IsErrorNinetyOneWhenUsed) {
    const Ref<Counted> nothing;
    EXPECT_FALSE(nothing);
    int caught = 0;
    try {
        nothing->value = 1;
    } catch (const platform::RuntimeError& error) {
        caught = error.Number;
    }
    EXPECT_EQ(caught, 91);
    EXPECT_THROW((*nothing).value = 1, platform::RuntimeError);
}

TEST(AReferenceSetToNothing, IsErrorNinetyOneWhenUsed) {
    Ref<Counted> reference = makeRef<Counted>(1);
    reference = nullptr;
    EXPECT_THROW(reference->value = 1, platform::RuntimeError);
}

TEST(AReference, IsCounted) {
    const Ref<Counted> one = makeRef<Counted>(7);
    Ref<Counted> two = one;
    EXPECT_EQ(one.use_count(), 2);
    two->value = 8;
    EXPECT_EQ(one->value, 8);
    EXPECT_TRUE(one == two);
    two.reset();
    EXPECT_EQ(one.use_count(), 1);
}

TEST(AReference, PassesAsOneToABase) {
    const Ref<Derived> derived = makeRef<Derived>(3);
    const Ref<Counted> base = derived;
    EXPECT_EQ(base->value, 3);
    EXPECT_EQ(base.get(), derived.get());
}
