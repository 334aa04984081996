#pragma once

namespace VizBridgeStep {

/// How a STEP file becomes the import library's model.
struct StepReadOptions {
    /// The largest distance, in millimetres, between a face and its triangles.
    double linearDeflection = 0.1;
    /// The largest angle, in radians, between the normals of neighbouring triangles.
    double angularDeflection = 0.5;
    /// Mesh the faces of a part on several threads.
    bool parallelMeshing = true;
};

} // namespace VizBridgeStep
