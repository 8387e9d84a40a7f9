// Lazily made singletons. Each test uses classes of its own, since an instance stays.

#include "1Base/StdUtil/StdUtilSingleton.h"

#include "support/MessageParameters.h"
#include "support/Registry.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <cstdlib>
#include <exception>
#include <stdexcept>
#include <type_traits>
#include <vector>

namespace {

using StdUtil::CSingleton;
using StdUtil::CSingletonManager;
using TWrapper = StdUtil::Detail::CSingletonWrapperBase;

using CStdUtilSingletonTest = TestSupport::CErrorTest;

static_assert(std::has_virtual_destructor_v<TWrapper>);
static_assert(sizeof(TWrapper) == sizeof(void*));
static_assert(sizeof(StdUtil::Detail::CSingletonWrapper<CSingleton, int>) == sizeof(TWrapper));

// Counts its instances; one class for each `number`.
template <int number>
class CCounted {
  public:
    CCounted() { ++made; }
    ~CCounted() { ++destroyed; }
    static int made;
    static int destroyed;
};

template <int number>
int CCounted<number>::made = 0;
template <int number>
int CCounted<number>::destroyed = 0;

// Deletes the wrapper made last, which nothing else does, and forgets it.
void deleteLastWrapper() {
    std::vector<TWrapper*>& singletons = CSingleton::getSingletons();
    delete singletons.back();
    singletons.pop_back();
}

TEST_F(CStdUtilSingletonTest, ThereIsOneInstanceAndItIsMadeAtTheFirstCall) {
    using TSingleton = CCounted<1>;
    EXPECT_EQ(CSingleton::get_<TSingleton>(), nullptr);
    EXPECT_EQ(TSingleton::made, 0);
    TSingleton& first = CSingleton::get<TSingleton>();
    EXPECT_EQ(&CSingleton::get<TSingleton>(), &first);
    EXPECT_EQ(&CSingletonManager<CSingleton>::get<TSingleton>(), &first);
    EXPECT_EQ(CSingleton::get_<TSingleton>(), &first);
    EXPECT_EQ(CSingletonManager<CSingleton>::get_<TSingleton>(), &first);
    EXPECT_EQ(TSingleton::made, 1);
}

TEST_F(CStdUtilSingletonTest, EachTypeHasAnInstanceAndAnEntryInTheOneList) {
    std::vector<TWrapper*> const& list = CSingleton::getSingletons();
    EXPECT_EQ(&list, &CSingletonManager<CSingleton>::getSingletons());
    std::size_t const before = list.size();
    void const* const first = &CSingleton::get<CCounted<2>>();
    EXPECT_EQ(list.size(), before + 1);
    void const* const second = &CSingleton::get<CCounted<3>>();
    EXPECT_EQ(list.size(), before + 2);
    EXPECT_NE(first, second);
    EXPECT_NE(list[before], list[before + 1]);
    EXPECT_NE((dynamic_cast<StdUtil::Detail::CSingletonWrapper<CSingleton, CCounted<2>> const*>(
                  list[before])),
              nullptr);
    CSingleton::get<CCounted<2>>();
    EXPECT_EQ(list.size(), before + 2);
}

class CFailsFirst {
  public:
    CFailsFirst() {
        if (++tries == 1)
            throw std::runtime_error("first");
    }
    static int tries;
};

int CFailsFirst::tries = 0;

TEST_F(CStdUtilSingletonTest, AConstructorThatThrowsLeavesNothingAndTheNextCallTriesAgain) {
    std::size_t const before = CSingleton::getSingletons().size();
    EXPECT_THROW(CSingleton::get<CFailsFirst>(), std::runtime_error);
    EXPECT_EQ(CSingleton::get_<CFailsFirst>(), nullptr);
    EXPECT_EQ(CSingleton::getSingletons().size(), before);
    CFailsFirst& instance = CSingleton::get<CFailsFirst>();
    EXPECT_EQ(&CSingleton::get<CFailsFirst>(), &instance);
    EXPECT_EQ(CFailsFirst::tries, 2);
    EXPECT_EQ(CSingleton::getSingletons().size(), before + 1);
}

TEST_F(CStdUtilSingletonTest, FillingAFullSlotFailsAnAssertion) {
    using TSingleton = CCounted<4>;
    TSingleton const& instance = CSingleton::get<TSingleton>();
    try {
        CSingletonManager<CSingleton>::instantiate<TSingleton>();
        FAIL();
    } catch (Error::TExcErrorAssert const& exc) {
        EXPECT_EQ(TestSupport::parameterOf(exc.getInfo().getMessage(), "expr"), L"s == __null");
    }
    EXPECT_EQ(CSingleton::get_<TSingleton>(), &instance);
    EXPECT_EQ(TSingleton::made, 1);
}

TEST_F(CStdUtilSingletonTest, InstancesAreMadeAndDeletedByTheTraits) {
    using TSingleton = CCounted<5>;
    TSingleton* const instance = CSingleton::createInstance<TSingleton>();
    EXPECT_EQ(TSingleton::made, 1);
    EXPECT_EQ(CSingleton::get_<TSingleton>(), nullptr);
    EXPECT_EQ(CSingleton::deleteInstance<TSingleton>(instance), nullptr);
    EXPECT_EQ(TSingleton::destroyed, 1);
    EXPECT_EQ(CSingleton::deleteInstance<TSingleton>(nullptr), nullptr);
    EXPECT_EQ(TSingleton::destroyed, 1);
}

TEST_F(CStdUtilSingletonTest, DeletingAWrapperUnmakesItsInstance) {
    using TSingleton = CCounted<6>;
    CSingleton::get<TSingleton>();
    deleteLastWrapper();
    EXPECT_EQ(TSingleton::destroyed, 1);
    EXPECT_EQ(CSingleton::get_<TSingleton>(), nullptr);
    CSingleton::get<TSingleton>();
    EXPECT_EQ(TSingleton::made, 2);
}

TEST_F(CStdUtilSingletonTest, UnmakingAnEmptySlotDoesNothing) {
    using TSingleton = CCounted<7>;
    CSingletonManager<CSingleton>::deInstantiate<TSingleton>();
    EXPECT_EQ(CSingleton::get_<TSingleton>(), nullptr);
    EXPECT_EQ(TSingleton::destroyed, 0);
}

// The manager knows nothing of where things are kept and how they are made.
class CFixedTraits {
  public:
    template <class TSingleton>
    static TSingleton*& get_() {
        static TSingleton* slot = nullptr;
        return slot;
    }
    static std::vector<TWrapper*>& getSingletons() {
        static std::vector<TWrapper*> singletons;
        return singletons;
    }
    template <class TSingleton>
    static TSingleton* createInstance() {
        static TSingleton instance;
        return &instance;
    }
    template <class TSingleton>
    static TSingleton* deleteInstance(TSingleton*) {
        return nullptr;
    }
};

TEST_F(CStdUtilSingletonTest, OtherTraitsKeepTheirInstancesElsewhere) {
    using TSingleton = CCounted<8>;
    std::size_t const before = CSingleton::getSingletons().size();
    TSingleton const& instance = CSingletonManager<CFixedTraits>::get<TSingleton>();
    EXPECT_EQ(&instance, CFixedTraits::get_<TSingleton>());
    EXPECT_EQ(CFixedTraits::getSingletons().size(), 1U);
    EXPECT_EQ(CSingleton::getSingletons().size(), before);
    EXPECT_EQ(CSingleton::get_<TSingleton>(), nullptr);
    delete CFixedTraits::getSingletons().back();
    EXPECT_EQ(CFixedTraits::get_<TSingleton>(), nullptr);
}

// The end of the process.

void say(char const* text) {
    std::fputs(text, stderr);
}

class CLoud {
  public:
    CLoud() { say("made "); }
    ~CLoud() { say("destroyed "); }
};

TEST_F(CStdUtilSingletonTest, NoInstanceIsDestroyedWhenTheProcessEnds) {
    // An ordinary static object is, and finds the singleton still in its place.
    auto const end = [] {
        class CObserver {
          public:
            ~CObserver() { say(instance == &CSingleton::get<CLoud>() ? "alive" : "gone"); }
            CLoud* instance = nullptr;
        };
        static CObserver observer;
        observer.instance = &CSingleton::get<CLoud>();
        std::exit(0);
    };
    EXPECT_EXIT(end(), testing::ExitedWithCode(0), "^made alive$");
}

TEST_F(CStdUtilSingletonTest, AnInstanceMayBeMadeWhileOtherStaticObjectsAreDestroyed) {
    auto const end = [] {
        class CMaker {
          public:
            ~CMaker() {
                std::size_t const before = CSingleton::getSingletons().size();
                CSingleton::get<CLoud>();
                say(CSingleton::getSingletons().size() == before + 1 ? "listed" : "lost");
            }
        };
        // Made before the list, and so destroyed after all that the list's own end could do.
        static CMaker const maker;
        CSingleton::get<CCounted<9>>();
        std::exit(0);
    };
    EXPECT_EXIT(end(), testing::ExitedWithCode(0), "^made listed$");
}

class CFailsAtEnd {
  public:
    ~CFailsAtEnd() noexcept(false) { throw std::runtime_error("end"); }
};

[[noreturn]] void sayTerminated() {
    say("terminated");
    std::_Exit(3);
}

TEST_F(CStdUtilSingletonTest, AnInstanceThatFailsWhileItIsUnmadeEndsTheProcess) {
    auto const end = [] {
        std::set_terminate(sayTerminated);
        CSingleton::get<CFailsAtEnd>();
        try {
            deleteLastWrapper();
        } catch (...) {
            say("caught");
        }
        std::_Exit(0);
    };
    EXPECT_EXIT(end(), testing::ExitedWithCode(3), "^terminated$");
}

} // namespace
