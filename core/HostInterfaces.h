// The automation interfaces of the host Osrik, as the plug-in calls them.
//
// Every method returns an HRESULT (success = not negative). Out values are written by the host; the
// plug-in pre-sets them to 0 or null before each call. Object pointers that come out carry one
// reference, which the receiver releases. Method order within each interface is part of the
// contract. The interface identifiers are the host's; the reference host and the plug-in share
// these.
#pragma once

#include "platform/Win32.h"

// Hooks the plug-in hands to the host: the host calls the idle hook while its queue is empty and
// the message hook for every message of its loop.
using MACROIDLEHOOK = BOOL(CALLBACK*)(LONG lCount);
using MACROMESSAGEHOOK = BOOL(CALLBACK*)(MSG* pMsg);

// The flags the plug-in creates its line, polyline and rectangle objects with.
inline constexpr LONG kNewGraphicFlags = 0x100;

struct IOsrikView;
struct IOsrikOverlay;
struct IOsrikGraphic2D;
struct IOsrikLine;
struct IOsrikPolyline;
struct IOsrikRectangle;
struct IOsrikSite;
struct IOsrikObjectTemplate;
struct IOsrikObject3D;

// The host application; the plug-in receives it in its factory callback.
struct IOsrikApplication : IDispatch {
    virtual HRESULT STDMETHODCALLTYPE GetProgramPath(BSTR* pPath) = 0;
    virtual HRESULT STDMETHODCALLTYPE GetMainWindow(HWND* phWnd) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetModeFlags(LONG lFlags) = 0;
    virtual HRESULT STDMETHODCALLTYPE GetModeFlags(LONG* plFlags) = 0;
    virtual HRESULT STDMETHODCALLTYPE GetActiveView(IOsrikView** ppView) = 0;
    virtual HRESULT STDMETHODCALLTYPE CreateToolbar(LONG lStyle, LONG* plToolbar) = 0;
    virtual HRESULT STDMETHODCALLTYPE DeleteToolbar(LONG lToolbar, LONG* plResult) = 0;
    virtual HRESULT STDMETHODCALLTYPE RefreshToolbars() = 0;
    virtual HRESULT STDMETHODCALLTYPE LoadObjectFile(BSTR bstrFile, LONG lFlag,
                                                     IOsrikObjectTemplate** ppTemplate) = 0;
    virtual HRESULT STDMETHODCALLTYPE CreateLineObject(LONG lFlags, IOsrikLine** ppLine) = 0;
    virtual HRESULT STDMETHODCALLTYPE CreatePolylineObject(LONG lFlags,
                                                           IOsrikPolyline** ppPolyline) = 0;
    virtual HRESULT STDMETHODCALLTYPE CreateRectangleObject(LONG lFlags,
                                                            IOsrikRectangle** ppRectangle) = 0;
    virtual HRESULT STDMETHODCALLTYPE CreateSiteObject(LONG lKind, IOsrikSite** ppSite) = 0;
    virtual HRESULT STDMETHODCALLTYPE PlaceSiteObject(IOsrikSite* pSite, IOsrikPolyline* pOutline,
                                                      LONG* plResult) = 0;
    virtual HRESULT STDMETHODCALLTYPE ShowToolbar(LONG lToolbar, LONG lX, LONG lY, LONG lVisible,
                                                  LONG lDocked, LONG* plResult) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetInputMode(LONG lMode) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetProgressText(BSTR bstrText) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetProgressPosition(LONG lPercent) = 0;
    virtual HRESULT STDMETHODCALLTYPE CreateHeightPoint(FLOAT fX, FLOAT fY, FLOAT fZ,
                                                        LONG* plResult) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetHelpFile(LONG lKind, BSTR bstrPath, LONG* plResult) = 0;
    virtual HRESULT STDMETHODCALLTYPE StartProgress(BSTR bstrTitle, LONG lFlags) = 0;
    virtual HRESULT STDMETHODCALLTYPE EndProgress() = 0;
    virtual HRESULT STDMETHODCALLTYPE GetDirectory(LONG lKind, BSTR* pPath) = 0;
    virtual HRESULT STDMETHODCALLTYPE BeginEditGroup(BSTR bstrName, LONG* plGroup) = 0;
    virtual HRESULT STDMETHODCALLTYPE ActivateEditGroup(LONG* plGroup, LONG* plResult) = 0;
    virtual HRESULT STDMETHODCALLTYPE EndEditGroup(LONG* plGroup, LONG lKeep, LONG* plResult) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetBatchMode(LONG lOn, LONG* plResult) = 0;

protected:
    ~IOsrikApplication() = default;
};

// The macro interface, obtained from the application by QueryInterface.
struct IOsrikMacro : IDispatch {
    virtual HRESULT STDMETHODCALLTYPE SetMessageHooks(MACROIDLEHOOK pfnIdle,
                                                      MACROMESSAGEHOOK pfnMessage) = 0;
    virtual HRESULT STDMETHODCALLTYPE AddButtonEntry(LONG lButton, HBITMAP hBitmap, LONG lStyle,
                                                     BSTR bstrText, LONG lNumber,
                                                     LONG* plEntry) = 0;
    virtual HRESULT STDMETHODCALLTYPE AddToolbarButton(LONG lToolbar, HBITMAP hBitmap,
                                                       BSTR bstrText, LONG lNumber,
                                                       LONG* plButton) = 0;

protected:
    ~IOsrikMacro() = default;
};

struct IOsrikView : IDispatch {
    virtual HRESULT STDMETHODCALLTYPE GetOverlay(IOsrikOverlay** ppOverlay) = 0;
    virtual HRESULT STDMETHODCALLTYPE UpdateView() = 0;

protected:
    ~IOsrikView() = default;
};

// The view's container of temporary graphics.
struct IOsrikOverlay : IDispatch {
    virtual HRESULT STDMETHODCALLTYPE AddToOverlay(IOsrikGraphic2D* pObject, LONG* plResult) = 0;
    virtual HRESULT STDMETHODCALLTYPE ClearOverlay() = 0;

protected:
    ~IOsrikOverlay() = default;
};

// What line, polyline and rectangle objects share.
struct IOsrikGraphic2D : IDispatch {
    virtual HRESULT STDMETHODCALLTYPE SetDrawMode(LONG lMode) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetRedraw(LONG lRedraw) = 0;

protected:
    ~IOsrikGraphic2D() = default;
};

struct IOsrikLine : IOsrikGraphic2D {
    virtual HRESULT STDMETHODCALLTYPE SetLineColor(LONG lColor) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetLineStyle(LONG lStyle) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetLineWidth(FLOAT fWidth) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetX1(FLOAT fX) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetX2(FLOAT fX) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetY1(FLOAT fY) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetY2(FLOAT fY) = 0;

protected:
    ~IOsrikLine() = default;
};

struct IOsrikPolyline : IOsrikGraphic2D {
    virtual HRESULT STDMETHODCALLTYPE SetFillColor(LONG lColor) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetFillStyle(LONG lStyle) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetLineColor(LONG lColor) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetLineStyle(LONG lStyle) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetLineWidth(FLOAT fWidth) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetClosed(VARIANT_BOOL bClosed) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetAuxColor(LONG lColor) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetAuxStyle(LONG lStyle) = 0;
    // vPoints: VT_ARRAY | VT_R4, 2 * lCount floats x0, y0, x1, y1, ...
    virtual HRESULT STDMETHODCALLTYPE SetPoints(LONG lCount, VARIANT vPoints) = 0;

protected:
    ~IOsrikPolyline() = default;
};

struct IOsrikRectangle : IOsrikGraphic2D {
    virtual HRESULT STDMETHODCALLTYPE SetFillColor(LONG lColor) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetFillStyle(LONG lStyle) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetLineColor(LONG lColor) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetLineStyle(LONG lStyle) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetLineWidth(FLOAT fWidth) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetAuxColor(LONG lColor) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetAuxStyle(LONG lStyle) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetHeight(FLOAT fHeight) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetX(FLOAT fX) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetAuxValue(LONG lValue) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetY(FLOAT fY) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetWidth(FLOAT fWidth) = 0;

protected:
    ~IOsrikRectangle() = default;
};

// A plot (kind 1) or terrain area (kind 2) before it is placed with its outline.
struct IOsrikSite : IDispatch {
protected:
    ~IOsrikSite() = default;
};

struct IOsrikObjectTemplate : IDispatch {
    virtual HRESULT STDMETHODCALLTYPE CreateObjectInstance(LONG lA, LONG lB,
                                                           IOsrikObject3D** ppObject) = 0;

protected:
    ~IOsrikObjectTemplate() = default;
};

struct IOsrikObject3D : IDispatch {
    virtual HRESULT STDMETHODCALLTYPE SetObjectMode(LONG lMode) = 0;
    virtual HRESULT STDMETHODCALLTYPE SetObjectLevel(LONG lLevel) = 0;
    virtual HRESULT STDMETHODCALLTYPE InsertObject(LONG lFlags, LONG* plResult) = 0;
    // vMatrix: VT_ARRAY | VT_R4, a 4 x 4 two-dimensional array, row (x, y, z, 1) last.
    virtual HRESULT STDMETHODCALLTYPE SetTransformMatrix(VARIANT vMatrix, LONG* plResult) = 0;
    virtual HRESULT STDMETHODCALLTYPE GetObjectExtents(LONG lFlags, FLOAT* pfX, FLOAT* pfY,
                                                       FLOAT* pfZ) = 0;

protected:
    ~IOsrikObject3D() = default;
};

// {5C0E7A10-4B1D-4E52-9A61-0D5E7A1B2C01} and following: the host's identifiers.
inline constexpr IID IID_IOsrikApplication = {
    0x5C0E7A10, 0x4B1D, 0x4E52, {0x9A, 0x61, 0x0D, 0x5E, 0x7A, 0x1B, 0x2C, 0x01}};
inline constexpr IID IID_IOsrikMacro = {
    0x5C0E7A10, 0x4B1D, 0x4E52, {0x9A, 0x61, 0x0D, 0x5E, 0x7A, 0x1B, 0x2C, 0x02}};
inline constexpr IID IID_IOsrikEvents = {
    0x5C0E7A10, 0x4B1D, 0x4E52, {0x9A, 0x61, 0x0D, 0x5E, 0x7A, 0x1B, 0x2C, 0x03}};
inline constexpr IID IID_IOsrikView = {
    0x5C0E7A10, 0x4B1D, 0x4E52, {0x9A, 0x61, 0x0D, 0x5E, 0x7A, 0x1B, 0x2C, 0x04}};
inline constexpr IID IID_IOsrikOverlay = {
    0x5C0E7A10, 0x4B1D, 0x4E52, {0x9A, 0x61, 0x0D, 0x5E, 0x7A, 0x1B, 0x2C, 0x05}};
inline constexpr IID IID_IOsrikGraphic2D = {
    0x5C0E7A10, 0x4B1D, 0x4E52, {0x9A, 0x61, 0x0D, 0x5E, 0x7A, 0x1B, 0x2C, 0x06}};
inline constexpr IID IID_IOsrikLine = {
    0x5C0E7A10, 0x4B1D, 0x4E52, {0x9A, 0x61, 0x0D, 0x5E, 0x7A, 0x1B, 0x2C, 0x07}};
inline constexpr IID IID_IOsrikPolyline = {
    0x5C0E7A10, 0x4B1D, 0x4E52, {0x9A, 0x61, 0x0D, 0x5E, 0x7A, 0x1B, 0x2C, 0x08}};
inline constexpr IID IID_IOsrikRectangle = {
    0x5C0E7A10, 0x4B1D, 0x4E52, {0x9A, 0x61, 0x0D, 0x5E, 0x7A, 0x1B, 0x2C, 0x09}};
inline constexpr IID IID_IOsrikSite = {
    0x5C0E7A10, 0x4B1D, 0x4E52, {0x9A, 0x61, 0x0D, 0x5E, 0x7A, 0x1B, 0x2C, 0x0A}};
inline constexpr IID IID_IOsrikObjectTemplate = {
    0x5C0E7A10, 0x4B1D, 0x4E52, {0x9A, 0x61, 0x0D, 0x5E, 0x7A, 0x1B, 0x2C, 0x0B}};
inline constexpr IID IID_IOsrikObject3D = {
    0x5C0E7A10, 0x4B1D, 0x4E52, {0x9A, 0x61, 0x0D, 0x5E, 0x7A, 0x1B, 0x2C, 0x0C}};

// The registration entry the host executable exports: module instance, factory, reserved 0. The
// host calls the factory with its application before returning.
using CREATEMACROOBJECT = BOOL(CALLBACK*)(IDispatch* pHost, LONG lReserved);
using REGISTERINPROCMACRO2 = LONG(CALLBACK*)(HINSTANCE hInstance, CREATEMACROOBJECT pfnFactory,
                                             LONG lReserved);
