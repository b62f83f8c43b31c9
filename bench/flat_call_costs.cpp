// Tells what a C function of the flat layer costs beside the C++ function behind it, both called in the
// shared library, as users of either call them. A program by itself for that.
//
//     vrl_bench_flat_call_costs <operation>
//
// prints nanoseconds: of the C function, of the C++ function, and, where a text crosses, of converting it and
// of an allocation of its size, as a loop and the allocator do these by themselves.

#include <algorithm>
#include <array>
#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <limits>
#include <memory>
#include <string>

#include "V2/Vrl.h"
#include "flat/vrl_flat.h"

namespace {

constexpr int k_calls = 1000000;
constexpr int k_rounds = 15;
// Text, length and end of 20 units, rounded up.
constexpr std::size_t k_block = 64;

/// Makes the compiler believe that somebody looks at `value`, and may have changed it.
template <class T>
void look_at(const T& value) {
    asm volatile("" : : "r"(&value) : "memory");
}

/// Nanoseconds of processor time that one of a million calls takes.
template <class Call>
double nanoseconds(const Call& call) {
    const std::clock_t start = std::clock();
    for (int i = 0; i < k_calls; ++i) call(i);
    return static_cast<double>(std::clock() - start) / CLOCKS_PER_SEC / k_calls * 1e9;
}

void nothing(int) {}

/// The calls in turn, so that what else the machine does meets all of them alike; each at its best.
template <class Flat, class Twin, class Conversion, class Allocation>
void compare(const Flat& flat, const Twin& twin, const Conversion& conversion, const Allocation& allocation) {
    std::array<double, 4> best;
    best.fill(std::numeric_limits<double>::infinity());
    for (int round = 0; round < k_rounds; ++round) {
        const std::array<double, 4> taken = {nanoseconds(flat), nanoseconds(twin), nanoseconds(conversion),
                                             nanoseconds(allocation)};
        std::transform(best.begin(), best.end(), taken.begin(), best.begin(),
                       [](double a, double b) { return std::min(a, b); });
    }
    std::printf("%.2f %.2f %.2f %.2f\n", best[0], best[1], best[2], best[3]);
}

void allocate(int) {
    void* const block = std::malloc(k_block);
    look_at(block);
    std::free(block);
}

// The objects are on the heap, as behind every handle.

void get_number() {
    const auto color = std::make_unique<vrl_v2::ColorSpaceCMYKType>();
    compare([&](int) { look_at(CSharp_ColorSpaceCMYKType_get_Black(color.get())); },
            [&](int) { look_at(color->get_Black()); }, nothing, nothing);
}

void set_number() {
    const auto color = std::make_unique<vrl_v2::ColorSpaceCMYKType>();
    compare([&](int i) { look_at(CSharp_ColorSpaceCMYKType_set_Black(color.get(), i % 100)); },
            [&](int i) { look_at(color->set_Black(i % 100)); }, nothing, nothing);
}

void get_text() {
    const auto header = std::make_unique<vrl_v2::Header>();
    const std::wstring wide = L"Measured patch 12345";
    header->set_Creator(wide);
    compare(
        [&](int) {
            char16_t* const text = CSharp_Header_get_Creator(header.get());
            look_at(*text);
            vrl_free_string(text);
        },
        [&](int) { look_at(header->get_Creator()); },
        [&](int) {
            look_at(wide);
            std::array<char16_t, k_block> out;
            std::transform(wide.begin(), wide.end(), out.begin(),
                           [](wchar_t c) { return static_cast<char16_t>(c); });
            look_at(out);
        },
        allocate);
}

void set_text() {
    const auto header = std::make_unique<vrl_v2::Header>();
    const std::wstring wide = L"Measured patch 12345";
    const std::u16string units = u"Measured patch 12345";
    compare([&](int) { look_at(CSharp_Header_set_Creator(header.get(), units.c_str())); },
            [&](int) { look_at(header->set_Creator(wide)); },
            [&](int) {
                look_at(units);
                // Its length has to be found first.
                const char16_t* const text = units.c_str();
                std::array<wchar_t, k_block> out;
                std::copy(text, text + std::char_traits<char16_t>::length(text), out.begin());
                look_at(out);
            },
            allocate);
}

}  // namespace

int main(int argc, char** argv) {
    const std::string operation = argc == 2 ? argv[1] : "";
    if (operation == "get a number") {
        get_number();
    } else if (operation == "set a number") {
        set_number();
    } else if (operation == "get a text of 20 units") {
        get_text();
    } else if (operation == "set a text of 20 units") {
        set_text();
    } else {
        return 2;
    }
}
