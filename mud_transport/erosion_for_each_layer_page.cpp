#include "mud_transport/erosion_for_each_layer_page.h"

#include "mud_transport/erosion_for_each_layer.h"

namespace gridbay {

CNmtErosionForEachLayerCriticalDlg::CNmtErosionForEachLayerCriticalDlg(CVdDoc& document)
    : LayerValuesDlg(document) {}
CNmtErosionForEachLayerCriticalDlg::~CNmtErosionForEachLayerCriticalDlg() = default;

CNmtErosionForEachLayerFactorDlg::CNmtErosionForEachLayerFactorDlg(CVdDoc& document)
    : LayerValuesDlg(document) {}
CNmtErosionForEachLayerFactorDlg::~CNmtErosionForEachLayerFactorDlg() = default;

CNmtErosionForEachLayerFactor1Dlg::CNmtErosionForEachLayerFactor1Dlg(CVdDoc& document)
    : LayerValuesDlg(document) {}
CNmtErosionForEachLayerFactor1Dlg::~CNmtErosionForEachLayerFactor1Dlg() = default;

CNmtErosionForEachLayerFactor2Dlg::CNmtErosionForEachLayerFactor2Dlg(CVdDoc& document)
    : LayerValuesDlg(document) {}
CNmtErosionForEachLayerFactor2Dlg::~CNmtErosionForEachLayerFactor2Dlg() = default;

CNmtErosionForEachLayerPowerDlg::CNmtErosionForEachLayerPowerDlg(CVdDoc& document)
    : LayerValuesDlg(document) {}
CNmtErosionForEachLayerPowerDlg::~CNmtErosionForEachLayerPowerDlg() = default;

CNmtErosionForEachLayerDensityDlg::CNmtErosionForEachLayerDensityDlg(CVdDoc& document)
    : LayerValuesDlg(document) {}
CNmtErosionForEachLayerDensityDlg::~CNmtErosionForEachLayerDensityDlg() = default;

}  // namespace gridbay
