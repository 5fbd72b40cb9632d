// A colour engine double for tests: records every call and can be told to fail.
#pragma once

#include <vector>

namespace engine_double {

enum class Call { SpectralToXYZ, SpectralToDensity, XYZToLab, LabToXYZ };

struct Record {
    Call call;
    int startNm = 0;
    int count = 0;
    int option = 0;
    std::vector<float> input; // spectrum, XYZ or Lab as received
};

/// Forgets every recorded call and every planned failure; outputs go back to defaults.
void Reset();
/// Every call since the last Reset, in order.
const std::vector<Record>& Calls();
/// Makes the n-th call (counting from 1 over all four functions) answer 1.
void FailCall(int n);
/// Makes every call of this function answer 1.
void FailAll(Call call);
/// Values the next successful calls write (defaults: XYZ 50, 60, 70; density 0.1,
/// 0.2, 0.3, 0.4; Lab 10, 20, 30; Lab-to-XYZ 0.4, 0.5, 0.6).
void SetXYZ(float x, float y, float z);
void SetDensity(float r, float g, float b, float v);
void SetLab(float l, float a, float b);
void SetLabToXYZ(float x, float y, float z);

} // namespace engine_double
