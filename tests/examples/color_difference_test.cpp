#include "examples/make_documents/color_difference.h"

#include <gtest/gtest.h>

#include <ostream>

namespace examples {
namespace {

struct lab_pair {
    int number;  ///< in the published table
    lab standard, sample;
    double difference;
};
void PrintTo(const lab_pair& pair, std::ostream* out) { *out << "pair " << pair.number; }

class Ciede2000 : public testing::TestWithParam<lab_pair> {};

TEST_P(Ciede2000, GivesThePublishedDifference) {
    const lab_pair& pair = GetParam();
    EXPECT_NEAR(delta_e_2000(pair.standard, pair.sample, 1, 1, 1), pair.difference, 0.00005);
    EXPECT_NEAR(delta_e_2000(pair.sample, pair.standard, 1, 1, 1), pair.difference, 0.00005);
}

// Sharma, Wu and Dalal, Color Research and Application 30 (2005), table 1: the pairs that take the turns of
// the formula, among them hues to both sides of 0 and of the mean's discontinuity.
INSTANTIATE_TEST_SUITE_P(
    Table1, Ciede2000,
    testing::Values(lab_pair{1, {50, 2.6772, -79.7751}, {50, 0, -82.7485}, 2.0425},
                    lab_pair{2, {50, 3.1571, -77.2803}, {50, 0, -82.7485}, 2.8615},
                    lab_pair{4, {50, -1.3802, -84.2814}, {50, 0, -82.7485}, 1.0000},
                    lab_pair{7, {50, 0, 0}, {50, -1, 2}, 2.3669},
                    lab_pair{9, {50, 2.49, -0.001}, {50, -2.49, 0.0009}, 7.1792},
                    lab_pair{11, {50, 2.49, -0.001}, {50, -2.49, 0.0011}, 7.2195},
                    lab_pair{13, {50, -0.001, 2.49}, {50, 0.0009, -2.49}, 4.8045},
                    lab_pair{15, {50, -0.001, 2.49}, {50, 0.0011, -2.49}, 4.7461},
                    lab_pair{16, {50, 2.5, 0}, {50, 0, -2.5}, 4.3065},
                    lab_pair{17, {50, 2.5, 0}, {73, 25, -18}, 27.1492},
                    lab_pair{18, {50, 2.5, 0}, {61, -5, 29}, 22.8977},
                    lab_pair{19, {50, 2.5, 0}, {56, -27, -3}, 31.9030},
                    lab_pair{20, {50, 2.5, 0}, {58, 24, 15}, 19.4535},
                    lab_pair{24, {50, 2.5, 0}, {50, 3.2592, 0.3350}, 1.0000},
                    lab_pair{25, {60.2574, -34.0099, 36.2677}, {60.4626, -34.1751, 39.4387}, 1.2644}));

// What the weights of the two formulas are at a standard without chroma: lightness alone counts.
TEST(ColorDifference, OfNeutralsIsTheDifferenceOfLightness) {
    const lab gray{50, 0, 0};
    const lab lighter{52, 0, 0};
    EXPECT_DOUBLE_EQ(delta_e_1976(gray, lighter), 2);
    EXPECT_DOUBLE_EQ(delta_e_1994(gray, lighter, 1, 1, 1), 2);
    EXPECT_DOUBLE_EQ(delta_e_1994(gray, lighter, 2, 1, 1), 1);
    const double weight = 0.040975 * 50 / (1 + 0.01765 * 50);  // ISO 105-J03, for L* from 16
    EXPECT_DOUBLE_EQ(delta_e_cmc(gray, lighter, 1, 1), 2 / weight);
    EXPECT_DOUBLE_EQ(delta_e_cmc(gray, lighter, 2, 1), 1 / weight);
}

TEST(ColorDifference, WeighsChromaByTheStandard) {
    const lab standard{50, 40, 0};
    const lab duller{50, 30, 0};
    EXPECT_DOUBLE_EQ(delta_e_1976(standard, duller), 10);
    EXPECT_DOUBLE_EQ(delta_e_1994(standard, duller, 1, 1, 1), 10 / (1 + 0.045 * 40));
    EXPECT_DOUBLE_EQ(delta_e_1994(duller, standard, 1, 1, 1), 10 / (1 + 0.045 * 30));
    EXPECT_DOUBLE_EQ(delta_e_cmc(standard, duller, 2, 1), 10 / (0.0638 * 40 / (1 + 0.0131 * 40) + 0.638));
}

}  // namespace
}  // namespace examples
