#pragma once

#include <VizBridge/contracts/platform/WString.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>

#include <exception>
#include <functional>
#include <optional>
#include <string>

/// The text of `text` as a reader sees it through ToWChar: absent when the pointer is null.
inline std::optional<std::u16string> TextOf(TarvexWString const& text) {
    char16_t const* characters = nullptr;
    bool const present = text.ToWChar(characters);
    if (present != (characters != nullptr)) {
        return u"<ToWChar answer disagrees with its pointer>";
    }
    return present ? std::optional<std::u16string>(characters) : std::nullopt;
}

/// A fault on `operation`, limited to `subject` if one is given, that throws the operation's
/// name as its text.
inline TarvexFault FaultOn(std::string const& operation,
                           std::optional<unsigned int> subject = std::nullopt) {
    TarvexFault fault;
    fault.operation = operation;
    fault.subject = subject;
    fault.what = operation;
    return fault;
}

/// What a call gave: "-" when it passed, the text of a std::exception, or "foreign" for a
/// TarvexForeignError.
inline std::string Outcome(std::function<void()> const& call) {
    try {
        call();
        return "-";
    } catch (std::exception const& error) {
        return error.what();
    } catch (TarvexForeignError const&) {
        return "foreign";
    }
}

/// The product that the tests of the import library share. Instances get their authoring ids
/// in the order they are added:
///    1 Top.1 -> assembly 1 "Top" {
///        2 10.1 -> part 10, 3 20.1 -> part 20,
///        4 Sub.1 -> assembly 2 "Sub" { 5 30.1 -> part 30, 6 20.2 -> part 20 },
///        7 20.3 -> part 20, 8 undefined -> 99, which was never added }
///    9 40.1 -> part 40
/// In millimetres. Part n is "P<n>", stored as "<n>.prt", and has one triangle, whose entity id
/// is n; converting it costs `conversionCost` microseconds. Depth first, the parts come as 10,
/// 20, 30, 40.
inline TarvexModel MakeTestProduct(unsigned int conversionCost = 0) {
    TarvexModel model;
    model.SetProductName(u"Gearbox");
    model.SetUnits(TarvexLengthUnit_Millimeter);
    model.AddAssembly(1, u"Top", u"top.asm");
    model.AddAssembly(2, u"Sub");
    for (unsigned int const id : {10u, 20u, 30u, 40u}) {
        std::string const number = std::to_string(id);
        TarvexAuthoredPartGeometry& geometry =
            model.AddPart(id, VizPort::Widen("P" + number), VizPort::Widen(number + ".prt"))
                .geometry;
        geometry.faces.push_back({id, {0, 0, 0, 1, 0, 0, 0, 1, 0}, {0, 1, 2}});
        geometry.conversionCostMicroseconds = conversionCost;
    }
    model.AddRootInstance(1, u"Top.1");
    model.AddInstance(1, 10, u"10.1");
    model.AddInstance(1, 20, u"20.1");
    model.AddInstance(1, 2, u"Sub.1");
    model.AddInstance(2, 30, u"30.1");
    model.AddInstance(2, 20, u"20.2");
    model.AddInstance(1, 20, u"20.3");
    model.AddInstance(1, 99, u"undefined");
    model.AddRootInstance(40, u"40.1");
    return model;
}
