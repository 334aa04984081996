#pragma once

#include <VizBridge/contracts/tarvex/TarvexDocument.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/contracts/tarvex/TarvexPSImportResult.h>
#include <VizBridge/import/VizBuilder.h>
#include <VizBridge/model/VizProductStructure.h>

#include <memory>
#include <string>
#include <vector>

namespace VizBridgeTarvex {

/// Runs the assembly form of MakeVizProductStructure on `model`. `out` receives the
/// structure even when the call throws, so a test can look at what was built.
inline void buildStructure(TarvexModel const& model, std::unique_ptr<VizProductStructure>& out) {
    TarvexPSImportResult const result = model.GetImportResult();
    TarvexInputProductStructure const input = model.GetInputProductStructure();
    TarvexDocument document = model.GetDocument();
    VizProductStructure* raw = nullptr;
    try {
        VizBuilder::MakeVizProductStructure(result, input, document, raw);
    } catch (...) {
        out.reset(raw);
        throw;
    }
    out.reset(raw);
}

inline std::unique_ptr<VizProductStructure> buildStructure(TarvexModel const& model) {
    std::unique_ptr<VizProductStructure> out;
    buildStructure(model, out);
    return out;
}

/// The product that most import tests share, "Prod": P.1 of part 10 "PartP", E.1 of the empty
/// sub-assembly 20, A.1 of sub-assembly 30 (Q.1 of part 40 "PartQ", B.1 of sub-assembly 60
/// (P.2 of part 10)), and M.1 of part 50 "PartM".
struct SharedProduct {
    SharedProduct() {
        model.SetProductName(u"Prod");
        model.AddPart(10, u"PartP", u"p.prt");
        model.AddAssembly(20, u"Empty", u"e.asm");
        model.AddAssembly(30, u"Asm", u"a.asm");
        model.AddPart(40, u"PartQ", u"q.prt");
        model.AddPart(50, u"PartM", u"m.prt");
        model.AddAssembly(60, u"Sub", u"s.asm");
        model.AddRootInstance(10, u"P.1");
        model.AddRootInstance(20, u"E.1");
        model.AddRootInstance(30, u"A.1");
        model.AddInstance(30, 40, u"Q.1");
        b1Instance = model.AddInstance(30, 60, u"B.1").instanceId;
        p2Instance = model.AddInstance(60, 10, u"P.2").instanceId;
        model.AddRootInstance(50, u"M.1");
    }
    TarvexModel model;
    unsigned int b1Instance = 0; ///< the authoring id of B.1, as instance paths name it
    unsigned int p2Instance = 0; ///< and of P.2, two levels down
};

/// A structure built from a model, and a builder on it.
struct ImportRun {
    explicit ImportRun(TarvexModel const& model)
        : structure(buildStructure(model)), input(model.GetInputProductStructure()),
          builder(*structure, input, nullptr) {}
    std::unique_ptr<VizProductStructure> structure;
    TarvexInputProductStructure input;
    VizBuilder builder;
};

/// `texts` a line each, behind `label`, as the tests' reports show them.
inline std::string reportLines(char const* label, std::vector<WString> const& texts) {
    std::string out;
    for (WString const& text : texts)
        out += label + VizPort::Narrow(text) + '\n';
    return out;
}

} // namespace VizBridgeTarvex
