#include "recording_engine.h"

#include <set>

#include "huekit.h"

namespace engine_double {
namespace {

struct State {
    std::vector<Record> calls;
    std::set<int> failingCalls;
    std::set<Call> failingFunctions;
    float xyz[3] = {50.0f, 60.0f, 70.0f};
    float density[4] = {0.1f, 0.2f, 0.3f, 0.4f};
    float lab[3] = {10.0f, 20.0f, 30.0f};
    float labToXyz[3] = {0.4f, 0.5f, 0.6f};
};

State& state() {
    static State s;
    return s;
}

// Records the call and answers whether it is to fail.
bool record(Call call, const float* input, int inputCount, int startNm, int count, int option) {
    Record r{call, startNm, count, option, {}};
    if (input != nullptr && inputCount > 0) {
        r.input.assign(input, input + inputCount);
    }
    auto& s = state();
    s.calls.push_back(r);
    const int n = static_cast<int>(s.calls.size());
    return s.failingCalls.count(n) != 0 || s.failingFunctions.count(call) != 0;
}

} // namespace

void Reset() {
    state() = State{};
}
const std::vector<Record>& Calls() {
    return state().calls;
}
void FailCall(int n) {
    state().failingCalls.insert(n);
}
void FailAll(Call call) {
    state().failingFunctions.insert(call);
}
void SetXYZ(float x, float y, float z) {
    state().xyz[0] = x;
    state().xyz[1] = y;
    state().xyz[2] = z;
}
void SetDensity(float r, float g, float b, float v) {
    state().density[0] = r;
    state().density[1] = g;
    state().density[2] = b;
    state().density[3] = v;
}
void SetLab(float l, float a, float b) {
    state().lab[0] = l;
    state().lab[1] = a;
    state().lab[2] = b;
}
void SetLabToXYZ(float x, float y, float z) {
    state().labToXyz[0] = x;
    state().labToXyz[1] = y;
    state().labToXyz[2] = z;
}

} // namespace engine_double

using engine_double::Call;
using engine_double::state;

extern "C" int HUEKIT_fromSpectralToCIEXYZ(const float* spectrum, int startNm, int count,
                                           float* xyz) {
    if (engine_double::record(Call::SpectralToXYZ, spectrum, count, startNm, count, 0)) {
        return 1;
    }
    for (int i = 0; i < 3; ++i) {
        xyz[i] = state().xyz[i];
    }
    return 0;
}

extern "C" int HUEKIT_fromSpectralToDensity(const float* spectrum, int startNm, int count,
                                            float* density, int option) {
    if (engine_double::record(Call::SpectralToDensity, spectrum, count, startNm, count, option)) {
        return 1;
    }
    for (int i = 0; i < 4; ++i) {
        density[i] = state().density[i];
    }
    return 0;
}

extern "C" int HUEKIT_fromCIEXYZToCIELAB(const float* xyz, float* lab) {
    if (engine_double::record(Call::XYZToLab, xyz, 3, 0, 0, 0)) {
        return 1;
    }
    for (int i = 0; i < 3; ++i) {
        lab[i] = state().lab[i];
    }
    return 0;
}

extern "C" int HUEKIT_fromCIELABToCIEXYZ(const float* lab, float* xyz) {
    if (engine_double::record(Call::LabToXYZ, lab, 3, 0, 0, 0)) {
        return 1;
    }
    for (int i = 0; i < 3; ++i) {
        xyz[i] = state().labToXyz[i];
    }
    return 0;
}
