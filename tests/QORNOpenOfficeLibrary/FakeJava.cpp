#include "QORNOpenOfficeLibrary/FakeJava.h"
#include "QORNOpenOfficeLibrary/Heap.h"
#include "QORNOpenOfficeLibrary/Recorder.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <utility>

namespace BridgeTest {
namespace {

constexpr std::size_t entryCount = sizeof(JNINativeInterface_) / sizeof(void (*)());

template <std::size_t INDEX>
void failLoudly() {
    std::fprintf(stderr, "Entry %zu of the JNI function table was called\n", INDEX);
    std::abort();
}

template <std::size_t... INDEX>
std::array<void (*)(), entryCount> makeFailingEntries(std::index_sequence<INDEX...>) {
    return {{failLoudly<INDEX>...}};
}

} // namespace

// At most one copy of the units is out at a time. It is exactly as long as the text, so that a
// sanitizer sees each step beyond it.
struct CFakeJava::CText : _jstring {
    std::string number;
    std::u16string units;
    std::unique_ptr<jchar[]> copy;
};

CFakeJava::CFakeJava() : JNIEnv_(), table_() {
    auto const entries = makeFailingEntries(std::make_index_sequence<entryCount>());
    static_assert(sizeof entries == sizeof table_, "a table of function pointers");
    std::memcpy(static_cast<void*>(&table_), entries.data(), sizeof table_);
    table_.GetStringChars = getStringChars;
    table_.GetStringLength = getStringLength;
    table_.ReleaseStringChars = releaseStringChars;
    functions = &table_;
}

CFakeJava::~CFakeJava() {
    reset();
}

void CFakeJava::reset() {
    for (auto const& text : strings_)
        EXPECT_EQ(text->copy, nullptr)
            << "the units of string " << text->number << " are still out";
    strings_.clear();
    unitsGiven_.clear();
    length_.reset();
}

jstring CFakeJava::makeString(std::u16string const& units) {
    strings_.push_back(std::make_unique<CText>());
    CText& text = *strings_.back();
    text.number = std::to_string(strings_.size());
    text.units = units;
    return &text;
}

jchar const* CFakeJava::getStringChars(JNIEnv* env, jstring string, jboolean* isCopy) {
    CHeapPause const pause;
    auto& text = *static_cast<CText*>(string);
    CRecorder::get().add("GetStringChars " + text.number);
    EXPECT_EQ(isCopy, nullptr);
    EXPECT_EQ(text.copy, nullptr) << "the units are out already";
    text.copy = std::make_unique<jchar[]>(text.units.size());
    std::copy(text.units.begin(), text.units.end(), text.copy.get());
    static_cast<CFakeJava*>(env)->unitsGiven_.push_back(text.copy.get());
    return text.copy.get();
}

jsize CFakeJava::getStringLength(JNIEnv* env, jstring string) {
    CHeapPause const pause;
    auto const& text = *static_cast<CText*>(string);
    CRecorder::get().add("GetStringLength " + text.number);
    return static_cast<CFakeJava*>(env)->length_.value_or(static_cast<jsize>(text.units.size()));
}

void CFakeJava::releaseStringChars(JNIEnv*, jstring string, jchar const* units) {
    CHeapPause const pause;
    auto& text = *static_cast<CText*>(string);
    CRecorder::get().add("ReleaseStringChars " + text.number);
    EXPECT_EQ(units, text.copy.get());
    // Whoever kept the pointer reads something else from here on.
    std::fill_n(text.copy.get(), text.units.size(), jchar{0xDEAD});
    text.copy.reset();
}

} // namespace BridgeTest
