#include "bench/packing.h"

#include <algorithm>
#include <stdexcept>

#include "V2/document_file.h"
#include "bench/child.h"
#include "bench/race.h"

namespace bench {
namespace {

constexpr char k_deflate[] = "zlib, deflate and CRC";
constexpr char k_inflate[] = "zlib, inflate and CRC";
constexpr char k_pack[] = "vrl's ZIP engine, pack";
constexpr char k_unpack[] = "vrl's ZIP engine, unpack";
constexpr char k_load[] = "vrl, load from memory";
constexpr char k_write[] = "vrl, write to string";
constexpr char k_packed_load[] = "vrl, load a packed file";
constexpr char k_packed_save[] = "vrl, save a packed file";

constexpr double k_of_raw = 0.95;
// Level with the peers, who call the same zlib: what is left between them is about what one run differs from
// the next by.
constexpr double k_of_peers = 0.97;
constexpr double k_of_parts = 1.1;
constexpr double k_megabyte = 1e6;

/// The results of one race.
class standings {
public:
    standings(const document& input, std::vector<standing> all, table& results)
        : m_subject(input.name + ", packed"), m_all(std::move(all)), m_results(results) {}

    void add(const std::string& name, const std::string& measure, target goal) const {
        m_results.add_rate(m_subject, name, of(name).rate(), relative_time(of(measure), {&of(name)}), goal);
    }

    /// How much faster `name` is than `peer`.
    void add_lead(const std::string& name, const std::string& peer) const {
        m_results.add_figure(m_subject, name + ": speed against " + peer,
                             relative_time(of(peer), {&of(name)}), "times", 2, at_least(k_of_peers));
    }

    /// The time of `name` over that of the two tasks that it consists of.
    void add_sum(const std::string& name, const std::string& one, const std::string& other) const {
        m_results.add_figure(m_subject, name + ": time against " + one + ", and " + other,
                             relative_time(of(name), {&of(one), &of(other)}), "times", 2,
                             at_most(k_of_parts));
    }

private:
    const standing& of(const std::string& name) const {
        for (const standing& one : m_all) {
            if (one.name == name) return one;
        }
        throw std::invalid_argument("nobody raced under the name " + name);
    }

    std::string m_subject;
    std::vector<standing> m_all;
    table& m_results;
};

double peak_of(const char* task, const document& input) {
    return std::stod(output_of({own_path(), "--peak-memory", task, input.path})) / k_megabyte;
}

}  // namespace

const std::vector<entry>& packing_contenders() {
    static const std::vector<entry> all = {
        {"libzip, pack", libzip_pack}, {"minizip, pack", minizip_pack}, {k_pack, engine_pack},
        {k_deflate, zlib_deflate},     {k_packed_save, door_save},      {k_write, vrl_write_string},
    };
    return all;
}

const std::vector<entry>& unpacking_contenders() {
    static const std::vector<entry> all = {
        {"libzip, unpack", libzip_unpack}, {"minizip, unpack", minizip_unpack}, {k_unpack, engine_unpack},
        {k_inflate, zlib_inflate},         {k_packed_load, door_load},          {k_load, vrl_load_memory},
    };
    return all;
}

std::string packed_path(const document& input) { return input.path + "z"; }

void make_packed(const document& input) {
    const auto loaded = vrl_v2::load_document(input.path);
    if (!loaded) throw std::runtime_error(loaded.message);
    const auto saved = vrl_v2::save_document(*loaded.document, packed_path(input));
    if (!saved) throw std::runtime_error(saved.message);
}

void measure_packing(const document& input, int rounds, table& results) {
    const standings by(input, race(packing_contenders(), input, rounds), results);
    by.add(k_deflate, k_deflate, {});
    by.add(k_pack, k_deflate, at_least(k_of_raw));
    for (const char* const peer : {"libzip, pack", "minizip, pack"}) {
        by.add(peer, k_deflate, {});
        by.add_lead(k_pack, peer);
    }
    by.add_sum(k_packed_save, k_deflate, k_write);
}

void measure_unpacking(const document& input, int rounds, table& results) {
    make_packed(input);
    const standings by(input, race(unpacking_contenders(), input, rounds), results);
    by.add(k_inflate, k_inflate, {});
    by.add(k_unpack, k_inflate, at_least(k_of_raw));
    for (const char* const peer : {"libzip, unpack", "minizip, unpack"}) {
        by.add(peer, k_inflate, {});
        by.add_lead(k_unpack, peer);
    }
    by.add_sum(k_packed_load, k_inflate, k_load);
}

void measure_packing_memory(const document& input, table& results) {
    const std::string subject = input.name + ", packed";
    // The model alone is what loading from memory takes: its bytes are there before.
    results.add_figure(subject, std::string("peak memory above the model: ") + k_packed_load,
                       peak_of(k_packed_load, input) - peak_of(k_load, input), "MB", 2, at_most(1.0));
    results.add_figure(subject, std::string("peak memory above the model: ") + k_packed_save,
                       peak_of(k_packed_save, input), "MB", 2, at_most(1.0));
}

}  // namespace bench
