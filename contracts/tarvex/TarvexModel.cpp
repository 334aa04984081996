#include <VizBridge/contracts/tarvex/TarvexModel.h>

#include <VizBridge/contracts/tarvex/TarvexDocument.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexModelData.h>
#include <VizBridge/contracts/tarvex/TarvexPSImportResult.h>
#include <VizBridge/contracts/tarvex/TarvexPartConversion.h>

#include <stdexcept>
#include <string>

namespace {

TarvexAuthoredReference& addReference(TarvexModelData& data, unsigned int uniqueId, bool isPart,
                                      std::optional<VizPort::WString> name,
                                      std::optional<VizPort::WString> storageName) {
    auto const [position, added] = data.references.try_emplace(uniqueId);
    if (added) {
        TarvexAuthoredReference& reference = position->second;
        reference.uniqueId = uniqueId;
        reference.isPart = isPart;
        reference.name = std::move(name);
        reference.storageName = std::move(storageName);
    }
    return position->second;
}

TarvexAuthoredInstance& addInstance(TarvexModelData& data, unsigned int referenceId,
                                    std::optional<VizPort::WString> name) {
    TarvexAuthoredInstance& instance = data.instances.emplace_back();
    instance.instanceId = static_cast<unsigned int>(data.instances.size());
    instance.referenceId = referenceId;
    instance.name = std::move(name);
    return instance;
}

} // namespace

TarvexModel::TarvexModel() : m_data(std::make_shared<TarvexModelData>()) {}
TarvexModel::~TarvexModel() = default;
TarvexModel::TarvexModel(TarvexModel&&) noexcept = default;
TarvexModel& TarvexModel::operator=(TarvexModel&&) noexcept = default;

TarvexModelData& TarvexModel::data() {
    // A moved-from model starts over with an empty model rather than failing.
    if (!m_data) {
        m_data = std::make_shared<TarvexModelData>();
    }
    return *m_data;
}

void TarvexModel::SetProductName(std::optional<VizPort::WString> name) {
    data().productName = std::move(name);
}

void TarvexModel::SetUnits(TarvexLengthUnitType unit) {
    data().unit = unit;
}

void TarvexModel::SetUniqueReferencesCount(std::optional<int> count) {
    data().uniqueReferencesCount = count;
}

TarvexAuthoredReference& TarvexModel::AddPart(unsigned int uniqueId,
                                              std::optional<VizPort::WString> name,
                                              std::optional<VizPort::WString> storageName) {
    return addReference(data(), uniqueId, true, std::move(name), std::move(storageName));
}

TarvexAuthoredReference& TarvexModel::AddAssembly(unsigned int uniqueId,
                                                  std::optional<VizPort::WString> name,
                                                  std::optional<VizPort::WString> storageName) {
    return addReference(data(), uniqueId, false, std::move(name), std::move(storageName));
}

TarvexAuthoredReference* TarvexModel::FindReference(unsigned int uniqueId) {
    if (!m_data) {
        return nullptr;
    }
    auto const found = m_data->references.find(uniqueId);
    return found == m_data->references.end() ? nullptr : &found->second;
}

TarvexAuthoredInstance& TarvexModel::AddRootInstance(unsigned int referenceId,
                                                     std::optional<VizPort::WString> name) {
    TarvexModelData& model = data();
    TarvexAuthoredInstance& instance = addInstance(model, referenceId, std::move(name));
    model.rootInstances.push_back(instance.instanceId);
    return instance;
}

TarvexAuthoredInstance& TarvexModel::AddInstance(unsigned int parentId, unsigned int referenceId,
                                                 std::optional<VizPort::WString> name) {
    TarvexAuthoredReference* const parent = FindReference(parentId);
    if (parent == nullptr) {
        throw std::invalid_argument("TarvexModel::AddInstance: no reference with unique id " +
                                    std::to_string(parentId));
    }
    TarvexAuthoredInstance& instance = addInstance(*m_data, referenceId, std::move(name));
    parent->instances.push_back(instance.instanceId);
    return instance;
}

TarvexAuthoredDocument& TarvexModel::Document() {
    return data().document;
}

void TarvexModel::AddMissingFile(std::optional<VizPort::WString> name) {
    data().missingFiles.push_back(std::move(name));
}

TarvexFaultPlan& TarvexModel::Faults() {
    return data().faults;
}

void TarvexModel::SetSpoolerDeliveryOrder(std::vector<unsigned int> order) {
    data().spoolerDeliveryOrder = std::move(order);
}

void TarvexModel::SetSpoolerIdAlias(unsigned int referenceId, unsigned int deliveredId) {
    data().spoolerIdAliases[referenceId] = deliveredId;
}

int TarvexModel::GetConversionCount(unsigned int referenceId) const {
    return m_data ? m_data->conversions.GetConversionCount(referenceId) : 0;
}

std::optional<std::thread::id> TarvexModel::GetConversionThread(unsigned int referenceId) const {
    return m_data ? m_data->conversions.GetConversionThread(referenceId) : std::nullopt;
}

TarvexEntity TarvexModel::MakeEntity(std::vector<unsigned int> instancePath,
                                     unsigned int entityId) const {
    return TarvexEntity(m_data, std::move(instancePath), entityId);
}

TarvexEntity TarvexModel::MakeEntity(TarvexAuthoredEntity entity) const {
    return TarvexEntity(m_data, std::move(entity));
}

void TarvexModel::SetFontDirectory(std::optional<std::string> directory) {
    data().fonts.SetDirectory(std::move(directory));
}

std::vector<TarvexImportCall> TarvexModel::GetImportCalls() const {
    return m_data ? m_data->importLog.Get() : std::vector<TarvexImportCall>();
}

TarvexPSImportResult TarvexModel::GetImportResult() const {
    return TarvexPSImportResult(m_data);
}

TarvexInputProductStructure TarvexModel::GetInputProductStructure() const {
    return TarvexInputProductStructure(m_data);
}

TarvexDocument TarvexModel::GetDocument() const {
    return TarvexDocument(m_data);
}
