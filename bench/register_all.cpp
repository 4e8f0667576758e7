// The one list of what the benchmark program registers.
namespace zb {
void registerConvFamilies();
void registerSampledFamilies();
void registerGammaFamily();
void registerPointOps();
void registerPlanesAndToneMaps();
void registerLibyuvPeers();
void registerOpenCVPeers();

void registerAll()
{
    registerConvFamilies();
    registerSampledFamilies();
    registerGammaFamily();
    registerPointOps();
    registerPlanesAndToneMaps();
    registerLibyuvPeers();
    registerOpenCVPeers();
}
} // namespace zb
