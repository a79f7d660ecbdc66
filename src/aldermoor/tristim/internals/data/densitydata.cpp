#include "aldermoor/tristim/internals/data/densitydata.h"

namespace Aldermoor::Tristim::Internals::Data {

// Weighting curves, 10 nm.  The colour curves are normalised to a sum of 1; their negative weights
// belong to them.
// Sources: ISO 5-3 for the visual response and the status densities, DIN 16536-2 for the DIN ones.

// clang-format off

// Visual response, 400..730 nm.  Its sum is 99.999886, not 1.
constinit const std::array<float, 34> kDensityVisual = std::to_array<float>({
    0.0005454F, 0.00196655F, 0.00778611F, 0.02652581F, 0.06118588F, 0.11655257F,  // 400 nm
    0.2102807F, 0.3616066F, 0.62153214F, 1.0393795F, 1.7921762F, 3.079981F,  // 460 nm
    4.771312F, 6.322516F, 7.6003876F, 8.568938F, 9.222837F, 9.457845F,  // 520 nm
    9.228659F, 8.541516F, 7.5473623F, 6.3571815F, 5.072025F, 3.7051337F,  // 580 nm
    2.562605F, 1.6367719F, 0.9722966F, 0.5302566F, 0.2921934F, 0.14588082F,  // 640 nm
    0.07534604F, 0.03978899F, 0.01949865F, 0.01001628F,  // 700 nm
});

// DIN 16536: seven bands around the centre of the filter.
constinit const std::array<float, 7> kDensityDin = std::to_array<float>({
    0.04054054F, 0.10810811F, 0.21621622F, 0.27027026F, 0.21621622F, 0.10810811F,
    0.04054054F,
});

// ISO status A, cyan filter, 580..730 nm.
constinit const std::array<float, 16> kDensityAnsiaCyan = std::to_array<float>({
    -0.000004F, -0.001077F, -0.002997F, 0.161662F, 0.337973F, 0.253121F,  // 580 nm
    0.138622F, 0.065315F, 0.02723F, 0.011853F, 0.004975F, 0.002006F,  // 640 nm
    0.000813F, 0.000314F, 0.000119F, 0.000075F,  // 700 nm
});

// ISO status A, magenta filter, 480..610 nm.
constinit const std::array<float, 14> kDensityAnsiaMagenta = std::to_array<float>({
    -0.000001F, -0.00012F, -0.002564F, 0.02887F, 0.191351F, 0.314337F,  // 480 nm
    0.258404F, 0.141437F, 0.053654F, 0.012955F, 0.001659F, 0.000035F,  // 540 nm
    -0.000015F, -0.000001F,  // 600 nm
});

// ISO status A, yellow filter, 400..510 nm.
constinit const std::array<float, 12> kDensityAnsiaYellow = std::to_array<float>({
    -0.000034F, -0.003725F, 0.027628F, 0.208478F, 0.323954F, 0.266839F,  // 400 nm
    0.137112F, 0.037233F, 0.002752F, -0.000217F, -0.000019F, -0.000001F,  // 460 nm
});

// ISO status E, cyan filter, 540..730 nm.
constinit const std::array<float, 20> kDensityAnsieCyan = std::to_array<float>({
    0.000001F, 0.000004F, 0.000027F, -0.000419F, -0.003728F, 0.114921F,  // 540 nm
    0.30713F, 0.272826F, 0.173613F, 0.080369F, 0.031981F, 0.015211F,  // 600 nm
    0.004947F, 0.001529F, 0.000911F, 0.000479F, 0.00016F, 0.000031F,  // 660 nm
    0.000005F, 0.000001F,  // 720 nm
});

// ISO status E, magenta filter, 460..630 nm.
constinit const std::array<float, 18> kDensityAnsieMagenta = std::to_array<float>({
    -0.000013F, -0.000095F, 0.001724F, 0.00964F, 0.054663F, 0.128802F,  // 460 nm
    0.175928F, 0.189941F, 0.167862F, 0.125972F, 0.080105F, 0.042078F,  // 520 nm
    0.017152F, 0.004815F, 0.001252F, 0.000163F, 0.000009F, 0.000001F,  // 580 nm
});

// ISO status E, yellow filter, 380..540 nm.
constinit const std::array<float, 17> kDensityAnsieYellow = std::to_array<float>({
    0.000357F, 0.005362F, 0.024215F, 0.05837F, 0.111997F, 0.157929F,  // 380 nm
    0.187024F, 0.174636F, 0.143432F, 0.088859F, 0.035169F, 0.011061F,  // 440 nm
    0.001589F, -0.000013F, 0.000008F, 0.000004F, 0.000001F,  // 500 nm
});

// ISO status I, cyan filter, 600..650 nm.
constinit const std::array<float, 6> kDensityAnsiiCyan = std::to_array<float>({
    -0.002876F, -0.012818F, 0.515694F, 0.515694F, -0.012818F, -0.002876F,  // 600 nm
});

// ISO status I, magenta filter, 510..560 nm.
constinit const std::array<float, 6> kDensityAnsiiMagenta = std::to_array<float>({
    -0.002876F, -0.012818F, 0.515694F, 0.515694F, -0.012818F, -0.002876F,  // 510 nm
});

// ISO status I, yellow filter, 400..460 nm.
constinit const std::array<float, 7> kDensityAnsiiYellow = std::to_array<float>({
    -0.000064F, -0.018503F, 0.156734F, 0.723666F, 0.156734F, -0.018503F,  // 400 nm
    -0.000064F,  // 460 nm
});

// ISO status T, magenta filter, 460..630 nm.
constinit const std::array<float, 18> kDensityAnsitMagenta = std::to_array<float>({
    -0.000013F, -0.000096F, 0.001727F, 0.00964F, 0.054663F, 0.128804F,  // 460 nm
    0.175926F, 0.189941F, 0.167862F, 0.125972F, 0.080105F, 0.042078F,  // 520 nm
    0.017152F, 0.004815F, 0.001252F, 0.000163F, 0.000009F, 0.000001F,  // 580 nm
});

// ISO status T, yellow filter, 380..570 nm.
constinit const std::array<float, 20> kDensityAnsitYellow = std::to_array<float>({
    0.000555F, 0.0021F, 0.008323F, 0.024537F, 0.055297F, 0.085297F,  // 380 nm
    0.114476F, 0.132614F, 0.140388F, 0.136479F, 0.119318F, 0.091433F,  // 440 nm
    0.05602F, 0.025683F, 0.007408F, 0.000055F, 0.000001F, 0.000013F,  // 500 nm
    0.000003F, 0.000001F,  // 560 nm
});

// SPI, cyan filter, 590..660 nm.
constinit const std::array<float, 8> kDensitySpiCyan = std::to_array<float>({
    0.00076974F, 0.00378494F, 0.05486815F, 0.46867895F, 0.42483968F, 0.04224447F,  // 590 nm
    0.00414065F, 0.00067339F,  // 650 nm
});

// SPI, magenta filter, 500..570 nm.
constinit const std::array<float, 8> kDensitySpiMagenta = std::to_array<float>({
    0.00036493F, 0.00292893F, 0.03309005F, 0.39563477F, 0.49147895F, 0.06993199F,  // 500 nm
    0.00531376F, 0.00125661F,  // 560 nm
});

// SPI, yellow filter, 390..470 nm.
constinit const std::array<float, 9> kDensitySpiYellow = std::to_array<float>({
    0.0001496F, 0.0008944F, 0.003028F, 0.12305775F, 0.48156747F, 0.3657375F,  // 390 nm
    0.02073189F, 0.00403653F, 0.00079683F,  // 450 nm
});

// clang-format on

}  // namespace Aldermoor::Tristim::Internals::Data
