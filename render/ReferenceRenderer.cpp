#include <VizBridge/render/ReferenceRenderer.h>

namespace VizBridgeTarvex {

namespace {

double cleaned(double value) {
    return value < 1e-10 ? 0.0 : value;
}

} // namespace

ReferenceRenderer::ReferenceRenderer(KolbaVizCore::ARenderer* r, double* const m) : renderer(r) {
    for (int i = 0; i < 16; ++i)
        matrix[i] = cleaned(m[i]);
}

ReferenceRenderer::ReferenceRenderer(KolbaVizCore::ARenderer* r, double (*const rotation)[3],
                                     double* const translation)
    : renderer(r), matrix{} {
    int const translationIndex[3] = {0, 2, 3};
    for (int row = 0; row < 3; ++row) {
        for (int column = 0; column < 3; ++column)
            matrix[4 * row + column] = cleaned(rotation[row][column]);
        matrix[4 * row + 3] = cleaned(translation[translationIndex[row]]);
    }
    matrix[15] = 1.0;
}

} // namespace VizBridgeTarvex
