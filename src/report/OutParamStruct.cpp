#include "report/OutParamStruct.h"

#include "platform/text/WideText.h"

namespace {

struct Column {
    const wchar_t* token;
    int OutParamStruct::*flag;
    int id;
};

// The columns in the order of their tokens in the ORDER key.
constexpr Column kColumns[] = {
    {L"ID", &OutParamStruct::OutID, opt::ID}, {L"LN", &OutParamStruct::OutLN, opt::LN},
    {L"HA", &OutParamStruct::OutHA, opt::HA}, {L"VA", &OutParamStruct::OutVA, opt::VA},
    {L"SD", &OutParamStruct::OutSD, opt::SD}, {L"HD", &OutParamStruct::OutHD, opt::HD},
    {L"VD", &OutParamStruct::OutVD, opt::VD}, {L"HT", &OutParamStruct::OutHT, opt::HT},
    {L"CO", &OutParamStruct::OutCO, opt::CO}, {L"EC", &OutParamStruct::OutEC, opt::EC},
    {L"NC", &OutParamStruct::OutNC, opt::NC}, {L"HC", &OutParamStruct::OutHC, opt::HC},
};

// The column of an option id, or null.
const Column* ColumnOf(int id) {
    for (const Column& column : kColumns) {
        if (column.id == id) return &column;
    }
    return nullptr;
}

}  // namespace

int* ColumnFlag(OutParamStruct& parameters, int id) {
    const Column* column = ColumnOf(id);
    return column != nullptr ? &(parameters.*column->flag) : nullptr;
}

int GetCheckOn(const OutParamStruct& parameters, int id) {
    if (id >= opt::AngleDms && id <= opt::AngleGons) return parameters.AngularUnit;
    if (id == opt::LengthMetres || id == opt::LengthFeet) return parameters.LinearUnit;
    const Column* column = ColumnOf(id);
    return column != nullptr ? parameters.*column->flag : 0;
}

void SetFlagsFromOrder(OutParamStruct& parameters, const std::wstring& order) {
    const std::wstring text = nedit::ToUpper(order);
    for (const Column& column : kColumns) {
        parameters.*column.flag = text.find(column.token) != std::wstring::npos ? 1 : 0;
    }
}

bool IsColumnToken(const std::wstring& token) {
    const std::wstring upper = nedit::ToUpper(token);
    for (const Column& column : kColumns) {
        if (upper == column.token) return true;
    }
    return false;
}

std::wstring OrderText(const OutParamStruct& parameters) {
    std::wstring order;
    for (const Column& column : kColumns) {
        if (parameters.*column.flag) order.append(column.token).append(L" ");
    }
    return order;
}
