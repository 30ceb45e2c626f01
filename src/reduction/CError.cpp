#include "reduction/CError.h"

#include "platform/messages/DialogHost.h"
#include "platform/messages/Translate.h"

std::wstring CError::MessageOf(int code) {
    switch (code) {
        case 0:
        case -11:
            return {};
        case -10:
            return L"INITIALIZING REDUCE PARAMETERS ERROR!!!!";
        case -9:
            return L"TRAVERSE STN LIST ERROR!!!!";
        case -8:
            return L"TRAVERSE STN LESS THAN 2!!!!";
        case -7:
            return L"NO TRAVERSE ROUTE DEFINE!!!!";
        case -6:
            return L"FORWARD STN DOES NOT EXIST!!!!";
        case -5:
            return L"OCC.STN DOES NOT EXIST!!!!";
        case -4:
            return L"MEASUREMENT NOT AVERAGE!!!!";
        case -3:
            return L"Route NOT FOUND!!!!";
        case -2:
            return L"Save Survey Data File";
        case 34701:
            return L"Invalid angle-checking point !";
        case 34702:
            return L"Invalid or empty traverse route !";
        default:
            return L"Default Error Has Occurred!!!!";
    }
}

int CError::Show(int code, nedit::DialogHost* host) {
    const std::wstring message = MessageOf(code);
    if (!message.empty())
        nedit::AppMessageBox(host, nedit::Translate(message), nedit::mb::IconStop);
    return code;
}
