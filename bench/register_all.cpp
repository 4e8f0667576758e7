// The one list of what the benchmark program registers.
namespace zb {
void registerConvFamilies();
void registerPeers();
void registerGammaFamily();

void registerAll()
{
    registerConvFamilies();
    registerGammaFamily();
    registerPeers();
}
} // namespace zb
