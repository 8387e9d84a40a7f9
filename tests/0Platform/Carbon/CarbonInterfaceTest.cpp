// Names and signatures of the module: this unit has only to compile.

#include <Carbon/Carbon.h>

#include <cstdint>
#include <type_traits>

namespace {

static_assert(sizeof(KeyMap) == 16 && std::is_same_v<KeyMap, BigEndianUInt32[4]>);
static_assert(std::is_same_v<decltype(BigEndianUInt32::bigEndianValue), std::uint32_t>);
static_assert(std::is_same_v<decltype(GetKeys), void(KeyMap)>);

// Seven fields of 16 bits in this order.
static_assert(std::is_aggregate_v<DateTimeRec> && sizeof(DateTimeRec) == 14);
constexpr DateTimeRec record = {1, 2, 3, 4, 5, 6, 7};
static_assert(record.year == 1 && record.month == 2 && record.day == 3 && record.hour == 4 &&
              record.minute == 5 && record.second == 6 && record.dayOfWeek == 7);
static_assert(std::is_same_v<decltype(record.year), std::int16_t>);

} // namespace
