#include "runtime/date_time.h"

#include <tuple>

namespace qbxV2 {
namespace {

/// What comparisons look at, in their order; the zone is not among it.
auto key_of(const s_datetime_record& r) { return std::tie(r.year, r.month, r.day, r.hours, r.mins, r.secs); }

}  // namespace

bool operator==(const c_date& a, const c_date& b) { return key_of(a.m_record) == key_of(b.m_record); }
bool operator<(const c_date& a, const c_date& b) { return key_of(a.m_record) < key_of(b.m_record); }
bool operator!=(const c_date& a, const c_date& b) { return !(a == b); }
bool operator<=(const c_date& a, const c_date& b) { return !(b < a); }
bool operator>(const c_date& a, const c_date& b) { return b < a; }
bool operator>=(const c_date& a, const c_date& b) { return !(a < b); }

}  // namespace qbxV2
