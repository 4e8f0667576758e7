// The one list of what the benchmark program registers.
namespace zb {
void registerConvFamilies();
void registerGammaFamily();
void registerLibyuvPeers();
void registerOpenCVPeers();

void registerAll()
{
    registerConvFamilies();
    registerGammaFamily();
    registerLibyuvPeers();
    registerOpenCVPeers();
}
} // namespace zb
