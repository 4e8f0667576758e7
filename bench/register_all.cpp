// The one list of what the benchmark program registers.
namespace zb {
void registerConvFamilies();
void registerSampledFamilies();
void registerGammaFamily();
void registerPlanesAndToneMaps();
void registerLibyuvPeers();
void registerOpenCVPeers();

void registerAll()
{
    registerConvFamilies();
    registerSampledFamilies();
    registerGammaFamily();
    registerPlanesAndToneMaps();
    registerLibyuvPeers();
    registerOpenCVPeers();
}
} // namespace zb
