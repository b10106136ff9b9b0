
library ieee;
use ieee.std_logic_1164.ALL;
use ieee.numeric_std.ALL;
library KORBAL;
use KORBAL.Kelements.ALL;

entity Cases is
   port ( in_a : in    std_logic; 
          yes  : out   std_logic);
end Cases;

architecture BEHAVIORAL of Cases is
   signal data : std_logic_vector (3 downto 0);
   signal net  : std_logic;
   component mix
      port ( I0 : in    std_logic; 
             I1 : in    std_logic; 
             O  : out   std_logic_vector (2 downto 0));
   end component;
   
begin
   yes <= net;
   uone : mix
      port map (I0=>in_a,
                I1=>data(3),
                O(2)=>net,
                O(1 downto 0)=>data(1 downto 0));
   
end BEHAVIORAL;

-- synopsys translate_off
configuration CFG_Cases of  Cases is
   for BEHAVIORAL
      for uone : mix
         use configuration WORK.CFG_mix;
      end for;
   end for;
end CFG_Cases;
-- synopsys translate_on

