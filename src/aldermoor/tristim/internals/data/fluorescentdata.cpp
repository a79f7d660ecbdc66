#include "aldermoor/tristim/internals/data/fluorescentdata.h"

namespace Aldermoor::Tristim::Internals::Data {

// clang-format off

// CIE illuminant F1, relative spectral power.  380..780 nm, 5 nm.
// Source: CIE 15:2004; CIE 015:2018, table 10.1.
constinit const std::array<float, 81> kIlluminantF1 = std::to_array<float>({
    1.87F, 2.36F, 2.94F, 3.47F, 5.17F, 19.49F,       // 380 nm
    6.13F, 6.24F, 7.01F, 7.79F, 8.56F, 43.67F,       // 410 nm
    16.94F, 10.72F, 11.35F, 11.89F, 12.37F, 12.75F,  // 440 nm
    13.00F, 13.15F, 13.23F, 13.17F, 13.13F, 12.85F,  // 470 nm
    12.52F, 12.20F, 11.83F, 11.50F, 11.22F, 11.05F,  // 500 nm
    11.03F, 11.18F, 11.53F, 27.74F, 17.05F, 13.55F,  // 530 nm
    14.33F, 15.01F, 15.52F, 18.29F, 19.55F, 15.48F,  // 560 nm
    14.91F, 14.15F, 13.22F, 12.19F, 11.12F, 10.03F,  // 590 nm
    8.95F, 7.96F, 7.02F, 6.20F, 5.42F, 4.73F,        // 620 nm
    4.15F, 3.64F, 3.20F, 2.81F, 2.47F, 2.18F,        // 650 nm
    1.93F, 1.72F, 1.67F, 1.43F, 1.29F, 1.19F,        // 680 nm
    1.08F, 0.96F, 0.88F, 0.81F, 0.77F, 0.75F,        // 710 nm
    0.73F, 0.68F, 0.69F, 0.64F, 0.68F, 0.69F,        // 740 nm
    0.61F, 0.52F, 0.43F,                             // 770 nm
});
static_assert(kIlluminantF1.size() == 81);

// CIE illuminant F2, relative spectral power.  380..780 nm, 5 nm.
// Source: CIE 15:2004; CIE 015:2018, table 10.1.
constinit const std::array<float, 81> kIlluminantF2 = std::to_array<float>({
    1.18F, 1.48F, 1.84F, 2.15F, 3.44F, 15.69F,       // 380 nm
    3.85F, 3.74F, 4.19F, 4.62F, 5.06F, 34.98F,       // 410 nm
    11.81F, 6.27F, 6.63F, 6.93F, 7.19F, 7.40F,       // 440 nm
    7.54F, 7.62F, 7.65F, 7.62F, 7.62F, 7.45F,        // 470 nm
    7.28F, 7.15F, 7.05F, 7.04F, 7.16F, 7.47F,        // 500 nm
    8.04F, 8.88F, 10.01F, 24.88F, 16.64F, 14.59F,    // 530 nm
    16.16F, 17.56F, 18.62F, 21.47F, 22.79F, 19.29F,  // 560 nm
    18.66F, 17.73F, 16.54F, 15.21F, 13.80F, 12.36F,  // 590 nm
    10.95F, 9.65F, 8.40F, 7.32F, 6.31F, 5.43F,       // 620 nm
    4.68F, 4.02F, 3.45F, 2.96F, 2.55F, 2.19F,        // 650 nm
    1.89F, 1.64F, 1.53F, 1.27F, 1.10F, 0.99F,        // 680 nm
    0.88F, 0.76F, 0.68F, 0.61F, 0.56F, 0.54F,        // 710 nm
    0.51F, 0.47F, 0.47F, 0.43F, 0.46F, 0.47F,        // 740 nm
    0.40F, 0.33F, 0.27F,                             // 770 nm
});
static_assert(kIlluminantF2.size() == 81);

// CIE illuminant F3, relative spectral power.  380..780 nm, 5 nm.
// Source: CIE 15:2004; CIE 015:2018, table 10.1.
constinit const std::array<float, 81> kIlluminantF3 = std::to_array<float>({
    0.82F, 1.02F, 1.26F, 1.44F, 2.57F, 14.36F,       // 380 nm
    2.70F, 2.45F, 2.73F, 3.00F, 3.28F, 31.85F,       // 410 nm
    9.47F, 4.02F, 4.25F, 4.44F, 4.59F, 4.72F,        // 440 nm
    4.80F, 4.86F, 4.87F, 4.85F, 4.88F, 4.77F,        // 470 nm
    4.67F, 4.62F, 4.62F, 4.73F, 4.99F, 5.48F,        // 500 nm
    6.25F, 7.34F, 8.78F, 23.82F, 16.14F, 14.59F,     // 530 nm
    16.63F, 18.49F, 19.95F, 23.11F, 24.69F, 21.41F,  // 560 nm
    20.85F, 19.93F, 18.67F, 17.22F, 15.65F, 14.04F,  // 590 nm
    12.45F, 10.95F, 9.51F, 8.27F, 7.11F, 6.09F,      // 620 nm
    5.22F, 4.45F, 3.80F, 3.23F, 2.75F, 2.33F,        // 650 nm
    1.99F, 1.70F, 1.55F, 1.27F, 1.09F, 0.96F,        // 680 nm
    0.83F, 0.71F, 0.62F, 0.54F, 0.49F, 0.46F,        // 710 nm
    0.43F, 0.39F, 0.39F, 0.35F, 0.38F, 0.39F,        // 740 nm
    0.33F, 0.28F, 0.21F,                             // 770 nm
});
static_assert(kIlluminantF3.size() == 81);

// CIE illuminant F4, relative spectral power.  380..780 nm, 5 nm.
// Source: CIE 15:2004; CIE 015:2018, table 10.1.
constinit const std::array<float, 81> kIlluminantF4 = std::to_array<float>({
    0.57F, 0.70F, 0.87F, 0.98F, 2.01F, 13.75F,       // 380 nm
    1.95F, 1.59F, 1.76F, 1.93F, 2.10F, 30.28F,       // 410 nm
    8.03F, 2.55F, 2.70F, 2.82F, 2.91F, 2.99F,        // 440 nm
    3.04F, 3.08F, 3.09F, 3.09F, 3.14F, 3.06F,        // 470 nm
    3.00F, 2.98F, 3.01F, 3.14F, 3.41F, 3.90F,        // 500 nm
    4.69F, 5.81F, 7.32F, 22.59F, 15.11F, 13.88F,     // 530 nm
    16.33F, 18.68F, 20.64F, 24.28F, 26.26F, 23.28F,  // 560 nm
    22.94F, 22.14F, 20.91F, 19.43F, 17.74F, 16.00F,  // 590 nm
    14.42F, 12.56F, 10.93F, 9.52F, 8.18F, 7.01F,     // 620 nm
    6.00F, 5.11F, 4.36F, 3.69F, 3.13F, 2.64F,        // 650 nm
    2.24F, 1.91F, 1.70F, 1.39F, 1.18F, 1.03F,        // 680 nm
    0.88F, 0.74F, 0.64F, 0.54F, 0.49F, 0.46F,        // 710 nm
    0.42F, 0.37F, 0.37F, 0.33F, 0.35F, 0.36F,        // 740 nm
    0.31F, 0.26F, 0.19F,                             // 770 nm
});
static_assert(kIlluminantF4.size() == 81);

// CIE illuminant F5, relative spectral power.  380..780 nm, 5 nm.
// Source: CIE 15:2004; CIE 015:2018, table 10.1.
// 690 nm is 1.48; 1.43 is a misprint in circulation.
constinit const std::array<float, 81> kIlluminantF5 = std::to_array<float>({
    1.87F, 2.35F, 2.92F, 3.45F, 5.10F, 18.91F,       // 380 nm
    6.00F, 6.11F, 6.85F, 7.58F, 8.31F, 40.76F,       // 410 nm
    16.06F, 10.32F, 10.91F, 11.40F, 11.83F, 12.17F,  // 440 nm
    12.40F, 12.54F, 12.58F, 12.52F, 12.47F, 12.20F,  // 470 nm
    11.89F, 11.61F, 11.33F, 11.10F, 10.96F, 10.97F,  // 500 nm
    11.16F, 11.54F, 12.12F, 27.78F, 17.73F, 14.47F,  // 530 nm
    15.20F, 15.77F, 16.10F, 18.54F, 19.50F, 15.39F,  // 560 nm
    14.64F, 13.72F, 12.69F, 11.57F, 10.45F, 9.35F,   // 590 nm
    8.29F, 7.32F, 6.41F, 5.63F, 4.90F, 4.26F,        // 620 nm
    3.72F, 3.25F, 2.83F, 2.49F, 2.19F, 1.93F,        // 650 nm
    1.71F, 1.52F, 1.48F, 1.26F, 1.13F, 1.05F,        // 680 nm
    0.96F, 0.85F, 0.78F, 0.72F, 0.68F, 0.67F,        // 710 nm
    0.65F, 0.61F, 0.62F, 0.59F, 0.62F, 0.64F,        // 740 nm
    0.55F, 0.47F, 0.40F,                             // 770 nm
});
static_assert(kIlluminantF5.size() == 81);

// CIE illuminant F6, relative spectral power.  380..780 nm, 5 nm.
// Source: CIE 15:2004; CIE 015:2018, table 10.1.
// 625 nm is 8.95; 8.96 is a misprint in circulation.
constinit const std::array<float, 81> kIlluminantF6 = std::to_array<float>({
    1.05F, 1.31F, 1.63F, 1.90F, 3.11F, 14.80F,       // 380 nm
    3.43F, 3.30F, 3.68F, 4.07F, 4.45F, 32.61F,       // 410 nm
    10.74F, 5.48F, 5.78F, 6.03F, 6.25F, 6.41F,       // 440 nm
    6.52F, 6.58F, 6.59F, 6.56F, 6.56F, 6.42F,        // 470 nm
    6.28F, 6.20F, 6.19F, 6.30F, 6.60F, 7.12F,        // 500 nm
    7.94F, 9.07F, 10.49F, 25.22F, 17.46F, 15.63F,    // 530 nm
    17.22F, 18.53F, 19.43F, 21.97F, 23.01F, 19.41F,  // 560 nm
    18.56F, 17.42F, 16.09F, 14.64F, 13.15F, 11.68F,  // 590 nm
    10.25F, 8.95F, 7.74F, 6.69F, 5.71F, 4.87F,       // 620 nm
    4.16F, 3.55F, 3.02F, 2.57F, 2.20F, 1.87F,        // 650 nm
    1.60F, 1.37F, 1.29F, 1.05F, 0.91F, 0.81F,        // 680 nm
    0.71F, 0.61F, 0.54F, 0.48F, 0.44F, 0.43F,        // 710 nm
    0.40F, 0.37F, 0.38F, 0.35F, 0.39F, 0.41F,        // 740 nm
    0.33F, 0.26F, 0.21F,                             // 770 nm
});
static_assert(kIlluminantF6.size() == 81);

// CIE illuminant F7, relative spectral power.  380..780 nm, 5 nm.
// Source: CIE 15:2004; CIE 015:2018, table 10.1.
constinit const std::array<float, 81> kIlluminantF7 = std::to_array<float>({
    2.56F, 3.18F, 3.84F, 4.53F, 6.15F, 19.37F,       // 380 nm
    7.37F, 7.05F, 7.71F, 8.41F, 9.15F, 44.14F,       // 410 nm
    17.52F, 11.35F, 12.00F, 12.58F, 13.08F, 13.45F,  // 440 nm
    13.71F, 13.88F, 13.95F, 13.93F, 13.82F, 13.64F,  // 470 nm
    13.43F, 13.25F, 13.08F, 12.93F, 12.78F, 12.60F,  // 500 nm
    12.44F, 12.33F, 12.26F, 29.52F, 17.05F, 12.44F,  // 530 nm
    12.58F, 12.72F, 12.83F, 15.46F, 16.75F, 12.83F,  // 560 nm
    12.67F, 12.45F, 12.19F, 11.89F, 11.60F, 11.35F,  // 590 nm
    11.12F, 10.95F, 10.76F, 10.42F, 10.11F, 10.04F,  // 620 nm
    10.02F, 10.11F, 9.87F, 8.65F, 7.27F, 6.44F,      // 650 nm
    5.83F, 5.41F, 5.04F, 4.57F, 4.12F, 3.77F,        // 680 nm
    3.46F, 3.08F, 2.73F, 2.47F, 2.25F, 2.06F,        // 710 nm
    1.90F, 1.75F, 1.62F, 1.54F, 1.45F, 1.32F,        // 740 nm
    1.17F, 0.99F, 0.81F,                             // 770 nm
});
static_assert(kIlluminantF7.size() == 81);

// CIE illuminant F8, relative spectral power.  380..780 nm, 5 nm.
// Source: CIE 15:2004; CIE 015:2018, table 10.1.
constinit const std::array<float, 81> kIlluminantF8 = std::to_array<float>({
    1.21F, 1.50F, 1.81F, 2.13F, 3.17F, 13.08F,       // 380 nm
    3.83F, 3.45F, 3.86F, 4.42F, 5.09F, 34.10F,       // 410 nm
    12.42F, 7.68F, 8.60F, 9.46F, 10.24F, 10.84F,     // 440 nm
    11.33F, 11.71F, 11.98F, 12.17F, 12.28F, 12.32F,  // 470 nm
    12.35F, 12.44F, 12.55F, 12.68F, 12.77F, 12.72F,  // 500 nm
    12.60F, 12.43F, 12.22F, 28.96F, 16.51F, 11.79F,  // 530 nm
    11.76F, 11.77F, 11.84F, 14.61F, 16.11F, 12.34F,  // 560 nm
    12.53F, 12.72F, 12.92F, 13.12F, 13.34F, 13.61F,  // 590 nm
    13.87F, 14.07F, 14.20F, 14.16F, 14.13F, 14.34F,  // 620 nm
    14.50F, 14.46F, 14.00F, 12.58F, 10.99F, 9.98F,   // 650 nm
    9.22F, 8.62F, 8.07F, 7.39F, 6.71F, 6.16F,        // 680 nm
    5.63F, 5.03F, 4.46F, 4.02F, 3.66F, 3.36F,        // 710 nm
    3.09F, 2.85F, 2.65F, 2.51F, 2.37F, 2.15F,        // 740 nm
    1.89F, 1.61F, 1.32F,                             // 770 nm
});
static_assert(kIlluminantF8.size() == 81);

// CIE illuminant F9, relative spectral power.  380..780 nm, 5 nm.
// Source: CIE 15:2004; CIE 015:2018, table 10.1.
// 530 nm is 10.78; 10.76 is a misprint in circulation.
constinit const std::array<float, 81> kIlluminantF9 = std::to_array<float>({
    0.90F, 1.12F, 1.36F, 1.60F, 2.59F, 12.80F,       // 380 nm
    3.05F, 2.56F, 2.86F, 3.30F, 3.82F, 32.62F,       // 410 nm
    10.77F, 5.84F, 6.57F, 7.25F, 7.86F, 8.35F,       // 440 nm
    8.75F, 9.06F, 9.31F, 9.48F, 9.61F, 9.68F,        // 470 nm
    9.74F, 9.88F, 10.04F, 10.26F, 10.48F, 10.63F,    // 500 nm
    10.78F, 10.96F, 11.18F, 27.71F, 16.29F, 12.28F,  // 530 nm
    12.74F, 13.21F, 13.65F, 16.57F, 18.14F, 14.55F,  // 560 nm
    14.65F, 14.66F, 14.61F, 14.50F, 14.39F, 14.40F,  // 590 nm
    14.47F, 14.62F, 14.72F, 14.55F, 14.40F, 14.58F,  // 620 nm
    14.88F, 15.51F, 15.47F, 13.20F, 10.57F, 9.18F,   // 650 nm
    8.25F, 7.57F, 7.03F, 6.35F, 5.72F, 5.25F,        // 680 nm
    4.80F, 4.29F, 3.80F, 3.43F, 3.12F, 2.86F,        // 710 nm
    2.64F, 2.43F, 2.26F, 2.14F, 2.02F, 1.83F,        // 740 nm
    1.61F, 1.38F, 1.12F,                             // 770 nm
});
static_assert(kIlluminantF9.size() == 81);

// CIE illuminant F10, relative spectral power.  380..780 nm, 5 nm.
// Source: CIE 15:2004; CIE 015:2018, table 10.1.
// 385 nm is 0.80 and 605 nm is 8.31; 0.63 and 8.81 are misprints in circulation.
constinit const std::array<float, 81> kIlluminantF10 = std::to_array<float>({
    1.11F, 0.80F, 0.62F, 0.57F, 1.48F, 12.16F,      // 380 nm
    2.12F, 2.70F, 3.74F, 5.14F, 6.75F, 34.39F,      // 410 nm
    14.86F, 10.40F, 10.76F, 10.67F, 10.11F, 9.27F,  // 440 nm
    8.29F, 7.29F, 7.91F, 16.64F, 16.73F, 10.44F,    // 470 nm
    5.94F, 3.34F, 2.35F, 1.88F, 1.59F, 1.47F,       // 500 nm
    1.80F, 5.71F, 40.98F, 73.69F, 33.61F, 8.24F,    // 530 nm
    3.38F, 2.47F, 2.14F, 4.86F, 11.45F, 14.79F,     // 560 nm
    12.16F, 8.97F, 6.52F, 8.31F, 44.12F, 34.55F,    // 590 nm
    12.09F, 12.15F, 10.52F, 4.43F, 1.95F, 2.19F,    // 620 nm
    3.19F, 2.77F, 2.29F, 2.00F, 1.52F, 1.35F,       // 650 nm
    1.47F, 1.79F, 1.74F, 1.02F, 1.14F, 3.32F,       // 680 nm
    4.49F, 2.05F, 0.49F, 0.24F, 0.21F, 0.21F,       // 710 nm
    0.24F, 0.24F, 0.21F, 0.17F, 0.21F, 0.22F,       // 740 nm
    0.17F, 0.12F, 0.09F,                            // 770 nm
});
static_assert(kIlluminantF10.size() == 81);

// CIE illuminant F11, relative spectral power.  380..780 nm, 5 nm.
// Source: CIE 15:2004; CIE 015:2018, table 10.1.
// 425 nm is 3.33; 3.38 is a misprint in circulation, which moves Z by 0.02.
constinit const std::array<float, 81> kIlluminantF11 = std::to_array<float>({
    0.91F, 0.63F, 0.46F, 0.37F, 1.29F, 12.68F,    // 380 nm
    1.59F, 1.79F, 2.46F, 3.33F, 4.49F, 33.94F,    // 410 nm
    12.13F, 6.95F, 7.19F, 7.12F, 6.72F, 6.13F,    // 440 nm
    5.46F, 4.79F, 5.66F, 14.29F, 14.96F, 8.97F,   // 470 nm
    4.72F, 2.33F, 1.47F, 1.10F, 0.89F, 0.83F,     // 500 nm
    1.18F, 4.90F, 39.59F, 72.84F, 32.61F, 7.52F,  // 530 nm
    2.83F, 1.96F, 1.67F, 4.43F, 11.28F, 14.76F,   // 560 nm
    12.73F, 9.74F, 7.33F, 9.72F, 55.27F, 42.58F,  // 590 nm
    13.18F, 13.16F, 12.26F, 5.11F, 2.07F, 2.34F,  // 620 nm
    3.58F, 3.01F, 2.48F, 2.14F, 1.54F, 1.33F,     // 650 nm
    1.46F, 1.94F, 2.00F, 1.20F, 1.35F, 4.10F,     // 680 nm
    5.58F, 2.51F, 0.57F, 0.27F, 0.23F, 0.21F,     // 710 nm
    0.24F, 0.24F, 0.20F, 0.24F, 0.32F, 0.26F,     // 740 nm
    0.16F, 0.12F, 0.09F,                          // 770 nm
});
static_assert(kIlluminantF11.size() == 81);

// CIE illuminant F12, relative spectral power.  380..780 nm, 5 nm.
// Source: CIE 15:2004; CIE 015:2018, table 10.1.
// 390 nm is 0.40; 0.45 is a misprint in circulation.
constinit const std::array<float, 81> kIlluminantF12 = std::to_array<float>({
    0.96F, 0.64F, 0.40F, 0.33F, 1.19F, 12.48F,      // 380 nm
    1.12F, 0.94F, 1.08F, 1.37F, 1.78F, 29.05F,      // 410 nm
    7.90F, 2.65F, 2.71F, 2.65F, 2.49F, 2.33F,       // 440 nm
    2.10F, 1.91F, 3.01F, 10.83F, 11.88F, 6.88F,     // 470 nm
    3.43F, 1.49F, 0.92F, 0.71F, 0.60F, 0.63F,       // 500 nm
    1.10F, 4.56F, 34.40F, 65.40F, 29.48F, 7.16F,    // 530 nm
    3.08F, 2.47F, 2.27F, 5.09F, 11.96F, 15.32F,     // 560 nm
    14.27F, 11.86F, 9.28F, 12.31F, 68.53F, 53.02F,  // 590 nm
    14.67F, 14.38F, 14.71F, 6.46F, 2.57F, 2.75F,    // 620 nm
    4.18F, 3.44F, 2.81F, 2.42F, 1.64F, 1.36F,       // 650 nm
    1.49F, 2.14F, 2.34F, 1.42F, 1.61F, 5.04F,       // 680 nm
    6.98F, 3.19F, 0.71F, 0.30F, 0.26F, 0.23F,       // 710 nm
    0.28F, 0.28F, 0.21F, 0.17F, 0.21F, 0.19F,       // 740 nm
    0.15F, 0.10F, 0.05F,                            // 770 nm
});
static_assert(kIlluminantF12.size() == 81);

// clang-format on

}  // namespace Aldermoor::Tristim::Internals::Data
