#ifndef ALDERMOOR_TESTS_TRISTIM_PUBLISHED_H
#define ALDERMOOR_TESTS_TRISTIM_PUBLISHED_H

/// Figures of colorimetry from outside, each table with its source.
namespace Aldermoor::Tristim::Tests {

struct WhiteCase {
  const char* illumination;
  const char* observer;
  double x, z;
};

// As commonly cited from ASTM E308-01, table 5, weights for 10 nm; not yet compared with a copy of
// the standard.
inline constexpr WhiteCase kPublishedWhites[] = {
    {"A", "TwoDegree", 109.850, 35.585},   {"C", "TwoDegree", 98.074, 118.232},
    {"D50", "TwoDegree", 96.422, 82.521},  {"D55", "TwoDegree", 95.682, 92.149},
    {"D65", "TwoDegree", 95.047, 108.883}, {"D75", "TwoDegree", 94.972, 122.638},
    {"F2", "TwoDegree", 99.186, 67.393},   {"F7", "TwoDegree", 95.041, 108.747},
    {"F11", "TwoDegree", 100.962, 64.350}, {"A", "TenDegree", 111.144, 35.200},
    {"C", "TenDegree", 97.285, 116.145},   {"D50", "TenDegree", 96.720, 81.427},
    {"D55", "TenDegree", 95.799, 90.926},  {"D65", "TenDegree", 94.811, 107.304},
    {"D75", "TenDegree", 94.416, 120.641}, {"F2", "TenDegree", 103.279, 69.027},
    {"F7", "TenDegree", 95.792, 107.686},  {"F11", "TenDegree", 103.863, 65.607}};

struct ChromaticityCase {
  const char* illumination;
  double x, y;
};

// Source: CIE 15:2004 (A, C, D50 to D75, FL1 to FL12; two-degree); B from the
// recommendation of 1931.
inline constexpr ChromaticityCase kChromaticities[] = {
    {"A", 0.44758, 0.40745},   {"B", 0.34842, 0.35161},   {"C", 0.31006, 0.31616},
    {"D50", 0.34567, 0.35851}, {"D55", 0.33243, 0.34744}, {"D65", 0.31272, 0.32903},
    {"D75", 0.29903, 0.31488}, {"F1", 0.3131, 0.3371},    {"F2", 0.3721, 0.3751},
    {"F3", 0.4091, 0.3941},    {"F4", 0.4402, 0.4031},    {"F5", 0.3138, 0.3452},
    {"F6", 0.3779, 0.3882},    {"F7", 0.3129, 0.3292},    {"F8", 0.3458, 0.3586},
    {"F9", 0.3741, 0.3727},    {"F10", 0.3458, 0.3588},   {"F11", 0.3805, 0.3769},
    {"F12", 0.4370, 0.4042}};

/// The colours published for the mean of 30 copies of the chart, under D50 and the two-degree
/// observer.  Source: project colour-science/colour, chromaticity_coordinates.py, average of 30.
struct ChartPatch {
  const char* name;
  float x, y, Y;
};

inline constexpr ChartPatch kChart24[] = {
    {"dark skin", 0.4325F, 0.3788F, 10.34F},    {"light skin", 0.4191F, 0.3748F, 35.25F},
    {"blue sky", 0.2761F, 0.3004F, 18.47F},     {"foliage", 0.3700F, 0.4501F, 13.35F},
    {"blue flower", 0.3020F, 0.2877F, 23.24F},  {"bluish green", 0.2856F, 0.3910F, 41.74F},
    {"orange", 0.5291F, 0.4075F, 31.17F},       {"purplish blue", 0.2339F, 0.2155F, 11.40F},
    {"moderate red", 0.5008F, 0.3293F, 19.79F}, {"purple", 0.3326F, 0.2556F, 6.44F},
    {"yellow green", 0.3989F, 0.4998F, 44.35F}, {"orange yellow", 0.4962F, 0.4428F, 43.58F},
    {"blue", 0.2040F, 0.1696F, 5.79F},          {"green", 0.3270F, 0.5033F, 23.07F},
    {"red", 0.5709F, 0.3298F, 12.68F},          {"yellow", 0.4694F, 0.4732F, 60.81F},
    {"magenta", 0.4177F, 0.2704F, 20.07F},      {"cyan", 0.2151F, 0.3037F, 19.03F},
    {"white 9.5", 0.3488F, 0.3628F, 91.29F},    {"neutral 8", 0.3451F, 0.3596F, 58.85F},
    {"neutral 6.5", 0.3446F, 0.3590F, 35.95F},  {"neutral 5", 0.3438F, 0.3589F, 19.12F},
    {"neutral 3.5", 0.3423F, 0.3576F, 8.93F},   {"black 2", 0.3439F, 0.3565F, 3.20F},
};

// L*, a*, b* of two colours and their difference, published to four decimals.
// G. Sharma, W. Wu, E. N. Dalal, Color Res. Appl. 30, 21 (2005), table 1.
inline constexpr double kPublished2000[][7] = {
    {50, 2.6772, -79.7751, 50, 0, -82.7485, 2.0425},
    {50, 3.1571, -77.2803, 50, 0, -82.7485, 2.8615},
    {50, 2.8361, -74.02, 50, 0, -82.7485, 3.4412},
    {50, -1.3802, -84.2814, 50, 0, -82.7485, 1},
    {50, -1.1848, -84.8006, 50, 0, -82.7485, 1},
    {50, -0.9009, -85.5211, 50, 0, -82.7485, 1},
    {50, 0, 0, 50, -1, 2, 2.3669},
    {50, -1, 2, 50, 0, 0, 2.3669},
    {50, 2.49, -0.001, 50, -2.49, 0.0009, 7.1792},
    {50, 2.49, -0.001, 50, -2.49, 0.001, 7.1792},
    {50, 2.49, -0.001, 50, -2.49, 0.0011, 7.2195},
    {50, 2.49, -0.001, 50, -2.49, 0.0012, 7.2195},
    {50, -0.001, 2.49, 50, 0.0009, -2.49, 4.8045},
    {50, -0.001, 2.49, 50, 0.001, -2.49, 4.8045},
    {50, -0.001, 2.49, 50, 0.0011, -2.49, 4.7461},
    {50, 2.5, 0, 50, 0, -2.5, 4.3065},
    {50, 2.5, 0, 73, 25, -18, 27.1492},
    {50, 2.5, 0, 61, -5, 29, 22.8977},
    {50, 2.5, 0, 56, -27, -3, 31.903},
    {50, 2.5, 0, 58, 24, 15, 19.4535},
    {50, 2.5, 0, 50, 3.1736, 0.5854, 1},
    {50, 2.5, 0, 50, 3.2972, 0, 1},
    {50, 2.5, 0, 50, 1.8634, 0.5757, 1},
    {50, 2.5, 0, 50, 3.2592, 0.335, 1},
    {60.2574, -34.0099, 36.2677, 60.4626, -34.1751, 39.4387, 1.2644},
    {63.0109, -31.0961, -5.8663, 62.8187, -29.7946, -4.0864, 1.263},
    {61.2901, 3.7196, -5.3901, 61.4292, 2.248, -4.962, 1.8731},
    {35.0831, -44.1164, 3.7933, 35.0232, -40.0716, 1.5901, 1.8645},
    {22.7233, 20.0904, -46.694, 23.0331, 14.973, -42.5619, 2.0373},
    {36.4612, 47.858, 18.3852, 36.2715, 50.5065, 21.2231, 1.4146},
    {90.8027, -2.0831, 1.441, 91.1528, -1.6435, 0.0447, 1.4441},
    {90.9257, -0.5406, -0.9208, 88.6381, -0.8985, -0.7239, 1.5381},
    {6.7747, -0.2908, -2.4247, 5.8714, -0.0985, -2.2286, 0.6377},
    {2.0776, 0.0795, -1.135, 0.9033, -0.0636, -0.5514, 0.9082},
};

/// Colour temperatures of the tables at 5 nm.  Source: CIE 15:2004.
struct Temperature {
  const char* illumination;
  double kelvin;
};

inline constexpr Temperature kTemperatures[] = {{"A", 2856},   {"C", 6774},   {"D50", 5003},
                                                {"D55", 5503}, {"D65", 6504}, {"D75", 7504}};

/// Colour temperature and Ra of F1 to F12.  Source: CIE 15:2004.
struct Fluorescent {
  double kelvin, index;
};

inline constexpr Fluorescent kFluorescents[] = {{6430, 76}, {4230, 64}, {3450, 57}, {2940, 51},
                                                {6350, 72}, {4150, 59}, {6500, 90}, {5000, 95},
                                                {4150, 90}, {5000, 81}, {4000, 83}, {3000, 83}};

}  // namespace Aldermoor::Tristim::Tests

#endif  // ALDERMOOR_TESTS_TRISTIM_PUBLISHED_H
