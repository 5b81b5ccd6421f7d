// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/neural/NetProperties.h"
#include "brindle/neural/Neuron.h"

#include <cstddef>
#include <cstdint>
#include <iosfwd>
#include <limits>
#include <span>
#include <string>
#include <vector>

namespace brindle {

/// A feed-forward net of neurons in layers: each neuron of a layer reads all values of the layer
/// before it, the first layer reads the input vector. It is used with fixed weights to hear the
/// root of a chord, and can be trained by back-propagation.
///
/// Counts: a negative count or size is taken as 0, more than kMaxHiddenLayers hidden layers as
/// kMaxHiddenLayers. Without a hidden layer the output neurons read the net's input.
///
/// Weights always come in one order: hidden layer 0 first, neuron by neuron, within a neuron by
/// input; then the next hidden layers; then the output neurons. There are no bias weights.
///
/// Every constructor, but not a copy, sets the calculation parameters of all neurons of the
/// process (see Neuron): the last net built decides how all nets calculate, and no two threads
/// may build, train or use nets at the same time.
class NeuronalNet {
public:
    /// A net with random weights. `hiddenSizes` are the neurons of each hidden layer, from the
    /// input on.
    NeuronalNet(int inputCount, std::span<const int> hiddenSizes, int outputCount,
                INPUT_TYPE inputType, ACT_TYPE actType, double slope, double threshold,
                OUTPUT_TYPE outputType, double outputThreshold);
    /// The same from records.
    NeuronalNet(const TFixedNetProp& fixedNetProp, const TDynNetProp& dynNetProp);
    /// A net with known weights, which are copied.
    explicit NeuronalNet(const TPredefinedWeights& predefined);
    /// As `predefined`, with `weights` in place of its own.
    NeuronalNet(const TPredefinedWeights& predefined, std::span<const double> weights);

    /// Makes the net anew, with random weights.
    void BuildNet(const TFixedNetProp& fixedNetProp, const TDynNetProp& dynNetProp);

    /// Runs the net on the present input vector.
    void use();
    /// Runs the net on `inputs`: at least get_input_neuron_count() values; where there are fewer,
    /// the others keep their last value.
    void use(const std::vector<double>& inputs);
    /// Sets the input vector without a run. Values beyond it are left out; where there are fewer,
    /// the others keep their last value.
    void setInput(const std::vector<double>& inputs);

    /// Values of the output neurons after the last run.
    [[nodiscard]] std::vector<double> get_outputs() const;
    /// Index of the output neuron with the greatest value, the lower one if two are equal; 0 if
    /// there is none.
    [[nodiscard]] std::size_t winner() const;
    /// The length of the input vector.
    [[nodiscard]] int get_input_neuron_count() const;
    /// The ends of the net, without negative counts.
    [[nodiscard]] const TFixedNetProp& get_fixed_net_prop() const { return mFixedNetProp; }
    /// What stands between them; the sizes of layers that are not there are 0.
    [[nodiscard]] const TDynNetProp& get_dyn_net_prop() const { return mDynNetProp; }
    /// All weights in their order, as acquire_weights takes them.
    [[nodiscard]] std::vector<double> get_weights() const;
    /// Copies the weights if every property of the record is that of this net; otherwise returns
    /// false and changes nothing. The length of the array is not looked at: where it is too short,
    /// the other weights stay.
    bool acquire_weights(const TPredefinedWeights& predefined);

    /// For all neurons of the process; every net that is built turns it on again.
    static void enable_flat_spot_elimination(bool isEnabled);
    /// How much of the change before goes into the next one, 0 for none; 0.6 at first.
    void set_momentum_amount(double amount) { mMomentumAmount = amount; }
    /// The momentum in force.
    [[nodiscard]] double get_momentum_amount() const { return mMomentumAmount; }
    /// The size of a training step; 1.0 at first, and what batch_train was given after it.
    void set_learning_factor(double factor) { mLearningFactor = factor; }
    /// The factor in force.
    [[nodiscard]] double get_learning_factor() const { return mLearningFactor; }
    /// Most cycles of batch_train; 10000 at first.
    void set_cycle_limit(int limit) { mCycleLimit = limit; }
    /// The limit in force.
    [[nodiscard]] int get_cycle_limit() const { return mCycleLimit; }

    /// One step of back-propagation with the present learning factor and momentum. Returns the
    /// sum of squared differences that is left. Outputs beyond those wanted are left as they are.
    double train(const training_pattern& pattern);
    /// Square root of the sum of squared differences between `wanted` and the outputs.
    [[nodiscard]] double getRMS(const std::vector<double>& wanted) const;
    /// Trains in cycles, each over all patterns in random order, until the summed error of a cycle
    /// is at most `errorTarget` or the cycle limit is reached. Keeps the learning factor. Prints
    /// its progress to standard output. Returns the number of cycles.
    int batch_train(const std::vector<training_pattern>& patterns, double learningFactor,
                    double errorTarget);
    /// Number of patterns whose winner is not the wanted one; their indexes go to `failures`.
    int batch_verify(const std::vector<training_pattern>& patterns,
                     std::vector<std::size_t>* failures = nullptr);
    /// Prints each pair of patterns with equal inputs and different outputs to standard output.
    static void check_learn_data_for_duplicates(const std::vector<training_pattern>& patterns);

    /// Report on the net: its properties, the patterns that it gets wrong, its weights, the same
    /// as source text and in the form that the loaders below read. Numbers have six digits.
    [[nodiscard]] std::string weights_to_text(int cycles, double overallError,
                                              double learningFactor,
                                              const std::vector<training_pattern>& patterns);
    /// Makes the net anew with the properties in a text file: lines of a value, "//" and a label.
    /// Other lines are ignored, and what is missing stays. Prints what it recognises. Returns
    /// false and leaves the net unchanged if the file cannot be opened or asks for a layer of more
    /// than kMaxLoadedLayerSize neurons or for more than kMaxLoadedWeights weights.
    bool load_net_properties_from_file(const char* path);
    /// The same from a stream.
    bool load_net_properties(std::istream& stream);
    /// Reads weights from the lines behind "weight definitions", one each; a short file leaves the
    /// others as they are. Prints each. Returns false if the file cannot be opened.
    bool load_weights_from_file(const char* path);
    /// The same from a stream.
    void load_weights(std::istream& stream);
    /// Most neurons of a layer that a file may ask for.
    static constexpr int kMaxLoadedLayerSize = 1 << 16;
    /// Most weights that a file may ask for.
    static constexpr std::int64_t kMaxLoadedWeights = 1 << 20;

    /// Prints the properties of the net to standard output.
    void trace() const;
    friend std::ostream& operator<<(std::ostream& stream, const NeuronalNet& net);

private:
    [[nodiscard]] std::span<const double> _InputsOfLayer(std::size_t layer);
    [[nodiscard]] double _SquaredError(const std::vector<double>& wanted) const;
    void _CalculateDeltas(const std::vector<double>& wanted);
    void _ChangeWeights();

    std::vector<double> mInput;
    std::vector<std::vector<Neuron>> mLayers;  ///< the hidden ones in order, the output layer last
    std::vector<double> mReadBuffer;           ///< both as wide as the widest layer
    std::vector<double> mWriteBuffer;
    std::vector<double> mDeltas;       ///< of all neurons, in the order of the layers
    std::vector<double> mLastChanges;  ///< of all weights, in their order
    bool mHasNoEarlierChange = true;
    double mMomentumAmount = 0.6;
    TFixedNetProp mFixedNetProp;
    TDynNetProp mDynNetProp;
    double mLearningFactor = 1.0;
    int mCycleLimit = 10000;
};

}  // namespace brindle
