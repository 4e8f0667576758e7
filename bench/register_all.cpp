// The one list of what the benchmark program registers.
namespace zb {
void registerConvFamilies();
void registerGammaFamily();
void registerPlanesAndToneMaps();
void registerLibyuvPeers();
void registerOpenCVPeers();

void registerAll()
{
    registerConvFamilies();
    registerGammaFamily();
    registerPlanesAndToneMaps();
    registerLibyuvPeers();
    registerOpenCVPeers();
}
} // namespace zb
